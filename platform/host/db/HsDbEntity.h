// The root of every object that is drawn: an object of a block, on a layer.
#pragma once

#include "platform/host/db/HsDbObject.h"

class HsDbEntity : public HsDbObject {
    HSRX_DECLARE_MEMBERS(HsDbEntity)

public:
    // Sets a layer that is unset to the database's current one (the working database's when null)
    // and runs subSetDatabaseDefaults, as the database does when the entity enters it.
    void setDatabaseDefaults(HsDbDatabase* database = nullptr);
    void subSetDatabaseDefaults(HsDbDatabase* database) override;

    HsDbObjectId layerId() const;
    // Needs write. eNullId for the null id; eWrongClass unless the id is a layer record.
    Hsys::ErrorStatus setLayer(const HsDbObjectId& layerId);
    // The block record the entity was appended to, or null.
    HsDbObjectId blockId() const;

    // A layer that is missing or no layer is reported, and set to the current layer when the
    // audit may fix.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    // After the object's fields, the layer: a hard pointer id, and an optional item of group 347
    // in text.
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override;
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override;

private:
    HsDbObjectId m_layerId;
};
