// The implementation base of geometric entities: an object coordinate system (ECS) that places
// the object's local geometry in the drawing.
#pragma once

#include "platform/base/obj/ZyrImpEnt.h"
#include "platform/host/ge/HsGeMatrix3d.h"

class HsDbEntity;

// Binary filing after ZyrImpEnt's: int16 80, then the ECS as its 16 doubles, row by row. A
// reader refuses a matrix with a number that is not finite or that cannot be inverted
// (eFilerError), and keeps the ECS it had.
class ZyrImpGeo : public ZyrImpEnt {
    HSRX_DECLARE_MEMBERS(ZyrImpGeo)

public:
    ZyrImpGeo();
    ~ZyrImpGeo() override;

    // ZyrImpEnt's, then the ECS; eBadArgument for an object that is no ZyrImpGeo.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    // Refuses a scale that cannot be undone (a factor that is zero or not finite) with
    // eBadArgument, so that derived classes scale only by valid factors. The ECS stays: a derived
    // class scales its own geometry.
    Hsys::ErrorStatus scaleBy(const ZyrScaleInfo& info) override;
    // The local extents moved by the ECS; the status of getLocalExtents.
    Hsys::ErrorStatus getWorldExtents(HsGeBoundBlock3d& block) const override;
    // The block moved by the inverse ECS goes to setLocalExtents with sAcceptAll.
    Hsys::ErrorStatus setWorldExtents(const HsGeBoundBlock3d& block) override;

    // Own virtual operations, in the order of their slots, with the defaults of an object without
    // an outline of its own.
    // The system in which the object is inserted: the identity.
    virtual void getInsertCoordSystem(HsGeMatrix3d& matrix) const;
    virtual bool updateAllReferencesGeometryVersions() const { return false; }
    virtual bool canBeAnchored() const { return true; }
    virtual bool allowAnchorXform() const { return true; }
    // The outline as a new entity of the drawing, owned by the caller; null here.
    virtual HsDbEntity* getBaseCurve() const;
    virtual bool supportsProfileCommands() const { return false; }
    // Fills ecs and gives the object's own profile, which it keeps; null here.
    virtual ZyrGeProfile* getBaseProfile(HsGeMatrix3d& ecs);
    // Takes the profile and the ECS; eDoesNotApply here, and the caller keeps the profile.
    virtual Hsys::ErrorStatus setBaseProfile(ZyrGeProfile* profile, const HsGeMatrix3d& ecs);

    const HsGeMatrix3d& ecs() const { return m_ecs; }
    void ecs(HsGeMatrix3d& ecs) const { ecs = m_ecs; }
    // Unchanged: eSuccess and no write. With validate a matrix that cannot be inverted or holds a
    // number that is not finite is refused with eBadArgument. Otherwise asserts write and stores.
    Hsys::ErrorStatus setEcs(const HsGeMatrix3d& ecs, bool validate = true);

private:
    // This level's own fields, after its base's and its version word.
    Hsys::ErrorStatus bdfInOwnFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutOwnFields(HsDbBdfFiler* filer) const;
    HsGeMatrix3d m_ecs;
};
