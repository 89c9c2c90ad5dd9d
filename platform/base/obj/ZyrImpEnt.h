// The implementation base of entities: a style, a profile and extents, each of which a class may
// or may not have.
#pragma once

#include "platform/base/obj/ZyrImpObj.h"

class HsGeBoundBlock3d;
class HsGePlane;
class ZyrGeProfile;

namespace Zyr {
// The signed sizes of a block along its three edges: each edge's length, negative when the edge
// points against its own axis (the first X, the second Y, the third Z).
void boundBlockToDims(const HsGeBoundBlock3d& block, double& x, double& y, double& z);
} // namespace Zyr

// Binary filing after ZyrImpObj's: int16 80.
class ZyrImpEnt : public ZyrImpObj {
    HSRX_DECLARE_MEMBERS(ZyrImpEnt)

public:
    ZyrImpEnt();
    ~ZyrImpEnt() override;

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

    // Own virtual operations, in the order of their slots. The defaults are those of an entity
    // without a style, a profile or extents of its own.
    // The null id.
    virtual HsDbObjectId styleId() const;
    // eDoesNotApply: there is no style to set.
    virtual Hsys::ErrorStatus setStyleId(const HsDbObjectId& styleId);
    // A new profile in the given plane, owned by the caller; null here.
    virtual ZyrGeProfile* getProfile(const HsGePlane& plane) const;
    // The extents in the object's own coordinates; eDoesNotApply here, block untouched.
    virtual Hsys::ErrorStatus getLocalExtents(HsGeBoundBlock3d& block) const;
    // options: ZyrExtentsOptions masks. eDoesNotApply here.
    virtual Hsys::ErrorStatus setLocalExtents(const HsGeBoundBlock3d& block, int options);
    // The extents in the drawing: the local ones, for an entity without a coordinate system.
    virtual Hsys::ErrorStatus getWorldExtents(HsGeBoundBlock3d& block) const;
    // setLocalExtents with ZyrExtentsOptions::sAcceptAll.
    virtual Hsys::ErrorStatus setWorldExtents(const HsGeBoundBlock3d& block);
};
