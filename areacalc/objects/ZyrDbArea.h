// Areas: the drawing entity that the module calculates, a named closed profile placed in the
// drawing, with a style.
#pragma once

#include "areacalc/objects/ZyrDbPair.h"
#include "areacalc/objects/ZyrImpPair.h"
#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/obj/ZyrDbGeo.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/res/ZyrRmCString.h"

#include <memory>

// The data of an area. Area and perimeter are computed from the profile on every request and
// never stored; the profile lies in the area's own coordinate system (the ECS of ZyrImpGeo).
//
// Binary filing after ZyrImpGeo's: int16 80 (and a dropped bool in versions 20 to 29), the style
// as a hard pointer id, the profile nested with its class, the name. A reader changes nothing
// unless it read every field.
class ZyrImpArea : public ZyrImpPair<ZyrImpArea, ZyrImpGeo> {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrImpArea)

public:
    // No profile, no style, and the name of a new area.
    ZyrImpArea();
    ~ZyrImpArea() override;

    // The virtual operations, in the order of their slots.
    // The base's part (whatever it answers), then profile, style and name of another area;
    // eBadArgument for any other object.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    // A style that is not a live area style of the drawing is counted, and when the audit may
    // fix, replaced by the standard area style (counted as fixed when there is one).
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    // The base's, the style, then the profile's.
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override;
    // Name, style, area and perimeter; an invalid profile shows a note for its area.
    void summaryInfo(ZyrDesc* desc) const override;
    // A null style becomes the drawing's standard area style, when it has one.
    Hsys::ErrorStatus subSetDatabaseDefaults(HsDbDatabase* database) override;
    // The profile by the X and Y factors without their signs; Z plays no part.
    Hsys::ErrorStatus scaleBy(const ZyrScaleInfo& info) override;
    HsDbObjectId styleId() const override;
    // eNullId for the null id; references are recorded as modified on a change.
    Hsys::ErrorStatus setStyleId(const HsDbObjectId& styleId) override;
    // A copy of the profile turned by the ECS, without the ECS's translation; the caller owns it.
    // Null without a profile. The plane is not used.
    ZyrGeProfile* getProfile(const HsGePlane& plane) const override;
    // The profile's rectangle, always 1 high. eBadArgument without a profile.
    Hsys::ErrorStatus getLocalExtents(HsGeBoundBlock3d& block) const override;
    // Sizes the profile to the block's width and height (ZyrExtentsOptions choose the current
    // ones instead). eBadArgument without a profile, and unless the width, the height and the
    // signed Z size are all above ZyrTol::sTight: an ignored Z counts as 0, so sIgnoreZ always
    // refuses.
    Hsys::ErrorStatus setLocalExtents(const HsGeBoundBlock3d& block, int options) override;
    // The local extents moved by the ECS; eSuccess even without a profile, the block then as it
    // was given.
    Hsys::ErrorStatus getWorldExtents(HsGeBoundBlock3d& block) const override;
    // A new closed polyline along the outer ring (holes do not reach it), placed by the ECS; the
    // caller owns it. The base's answer without a profile or rings.
    HsDbEntity* getBaseCurve() const override;
    bool supportsProfileCommands() const override { return true; }
    // Fills ecs and gives the profile, which the area keeps.
    ZyrGeProfile* getBaseProfile(HsGeMatrix3d& ecs) override;
    // setProfile, then the ECS; eSuccess whatever these answered.
    Hsys::ErrorStatus setBaseProfile(ZyrGeProfile* profile, const HsGeMatrix3d& ecs) override;

    const ZyrRmCString& areaName() const { return m_name; }
    Hsys::ErrorStatus setAreaName(const ZyrRmCString& name);
    // The area keeps the profile; null when it has none.
    ZyrGeProfile* profile() const { return m_profile.get(); }
    // Takes the profile over and deletes the one held. Null, or the profile held, changes nothing.
    Hsys::ErrorStatus setProfile(ZyrGeProfile* profile);

    // The signed sum of the rings' areas; 0 without a profile.
    double area() const;
    // The length of every ring, holes included; 0 without a profile.
    double perimeter() const;

private:
    // The text of an area value in a summary, or the note for an invalid outline.
    ZyrRmCString areaForDisplay(double value, bool invalidProfile) const;
    Hsys::ErrorStatus bdfInAreaFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutAreaFields(HsDbBdfFiler* filer) const;
    // The profile's rectangle, refreshed when stale.
    void refreshProfileExtents() const;

    std::unique_ptr<ZyrGeProfile> m_profile;
    HsDbHardPointerId m_style;
    ZyrRmCString m_name;
};

// The area as the database stores it; everything is forwarded to ZyrImpArea. Getters need read
// access, and a change asserts write on the area.
class ZyrDbArea : public ZyrDbPair<ZyrDbArea, ZyrDbGeo, ZyrImpArea> {
    ZYR_AREACALC_DECLARE_FILED_MEMBERS(ZyrDbArea)

public:
    static constexpr const wchar_t* kClassIdWord = L"ZyrArea";
    // The layer key of areas: they go on the layer "AREA" (Zyr::setLayer).
    static constexpr const wchar_t* kLayerKey = L"AREA";

    using ZyrDbPair::ZyrDbPair;

    // The base's refusal is returned as it is. An object of another class than ZyrDbArea taking
    // the area's place is no area to the groups: every group that holds the area lets it go.
    // Groups that cannot be opened or upgraded keep it. The base's status.
    Hsys::ErrorStatus subHandOverTo(HsDbObject* newObject) override;
    void getLayerKey(ZyrRmCString& key) const override;
    bool isModelGeometry() const override { return true; }

    // The forwards give the values of an area without data (empty name, no profile, 0.0) and
    // eNullPointer for a change while the area has no ZyrImpArea.
    ZyrRmCString name() const;
    Hsys::ErrorStatus setName(const ZyrRmCString& name);
    double area() const;
    double perimeter() const;
    ZyrGeProfile* profile() const;
    Hsys::ErrorStatus setProfile(ZyrGeProfile* profile);

    ZyrImpArea* areaImp() { return pairImp(); }
    const ZyrImpArea* areaImp() const { return pairImp(); }
};
