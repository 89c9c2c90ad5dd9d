// The public base of every persistent entity pair, with the entity's list of overrides.
#pragma once

#include "platform/base/obj/ZyrDbImpOwner.h"
#include "platform/base/obj/ZyrImpEnt.h"
#include "platform/host/db/HsDbEntity.h"

#include <cstdint>
#include <vector>

struct _GUID;
class HsGePlane;
class ZyrGeProfile;
class ZyrOverride;
class ZyrRmCString;

// Binary filing: HsDbEntity's fields, int16 80, the implementation object nested with its class,
// then the overrides: a uint32 count and each override nested with its class. A derived public
// class with no fields of its own adds exactly its own int16 80 after this.
class ZyrDbEntity : public HsDbEntity, public ZyrDbImpOwner {
    HSRX_DECLARE_MEMBERS(ZyrDbEntity)

public:
    // createImp true gives the entity a plain ZyrImpEnt, which a derived class replaces.
    explicit ZyrDbEntity(bool createImp = true);
    // Deletes the overrides and the implementation object.
    ~ZyrDbEntity() override;

    // The virtual operations, in the order of their slots.
    // The implementation object and the overrides of another ZyrDbEntity; eBadArgument for any
    // other object, and for an override that cannot be cloned (nothing changed then). Needs write.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    void subSetDatabaseDefaults(HsDbDatabase* database) override;
    // HsDbEntity's audit, the implementation object's, then each override's.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override;
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override;
    // The implementation object's references, then each override's.
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override;
    // The id derived from the class's registered name (Zyr::getEntityClassIdFromString).
    virtual Hsys::ErrorStatus subGetClassID(_GUID* id) const;
    virtual std::int16_t ZyrBirthVersion() const;
    virtual std::int16_t ZyrCurrentVersion() const;
    // The key of the layer the entity belongs on (Zyr::setLayer); empty here: no layer of its own.
    virtual void getLayerKey(ZyrRmCString& key) const;
    // The implementation object's, read access; the null id without one.
    virtual HsDbObjectId styleId() const;
    // The implementation object's, write access; eNullPointer without one.
    virtual Hsys::ErrorStatus setStyleId(const HsDbObjectId& styleId);
    // The implementation object's, read access; null without one.
    virtual ZyrGeProfile* getProfile(const HsGePlane& plane) const;
    // Whether the entity is geometry of the model (as opposed to an annotation); false here.
    virtual bool isModelGeometry() const;

    // Inline: every reading of an entity's state passes here.
    ZyrImpEnt* imp() { return static_cast<ZyrImpEnt*>(ownedImp()); }
    const ZyrImpEnt* imp() const { return static_cast<const ZyrImpEnt*>(ownedImp()); }
    // Deletes the held implementation object and takes imp (null leaves none). Needs write.
    void setImp(ZyrImpEnt* imp);

    // The implementation object's setToStandard and subSetDatabaseDefaults. Needs write;
    // eNullPointer without an implementation object.
    Hsys::ErrorStatus initializeStandardsAndDefaults(HsDbDatabase* database);

    int overrideCount() const;
    // Null outside [0, overrideCount()). Read access.
    ZyrOverride* getOverrideAt(int index) const;
    // Takes ownership and appends, making the entity the override's parent. Needs write;
    // eNullPointer for null, eAlreadyPresent for an override that is in the list (the caller
    // keeps a refused one).
    Hsys::ErrorStatus appendOverride(ZyrOverride* override);
    // Deletes the override. Needs write; eInvalidIndex outside [0, overrideCount()).
    Hsys::ErrorStatus deleteOverrideAt(int index);

protected:
    HsDbObject* self() override { return this; }

private:
    Hsys::ErrorStatus bdfOutOverrides(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus bdfInOverrides(HsDbBdfFiler* filer);
    void deleteOverrides();

    std::vector<ZyrOverride*> m_overrides;
};
