// The public base of geometric entities: the ECS of the implementation object and the block the
// entity stands in.
#pragma once

#include "platform/base/obj/ZyrDbEntity.h"

class HsGeMatrix3d;
class ZyrImpGeo;

// Binary filing after ZyrDbEntity's: int16 80.
class ZyrDbGeo : public ZyrDbEntity {
    HSRX_DECLARE_MEMBERS(ZyrDbGeo)

public:
    // createImp true gives the entity a plain ZyrImpGeo, which a derived class replaces.
    explicit ZyrDbGeo(bool createImp = true);
    ~ZyrDbGeo() override;

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

    // The implementation object as a ZyrImpGeo, or null when it is none.
    ZyrImpGeo* geoImp();
    const ZyrImpGeo* geoImp() const;

    // Read access; the identity without a geometric implementation.
    HsGeMatrix3d ecs() const;
    // Write access; ZyrImpGeo::setEcs, or eNullPointer without a geometric implementation.
    Hsys::ErrorStatus setEcs(const HsGeMatrix3d& ecs, bool validate = true);
    // The block record the entity was appended to, or null.
    HsDbObjectId blockId() const { return HsDbEntity::blockId(); }
};
