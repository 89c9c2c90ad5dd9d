// A closed outline in the plane: owned rings, where positive rings add area and negative rings
// are holes.
#pragma once

#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/obj/ZyrImpObj.h"
#include "platform/host/ge/HsGeContext.h"

#include <memory>
#include <vector>

class HsDbBdfFiler;
class HsGeMatrix3d;

// A profile is an implementation object, nested in the object that holds it (an area), which
// makes itself the profile's parent: every change asserts write on the public object at the top,
// so that a transaction can put the profile back. A profile without a parent is always writable.
// A profile holds no references to other objects and takes nothing from the database.
class ZyrGeProfile : public ZyrImpObj {
    HSRX_DECLARE_MEMBERS(ZyrGeProfile)

public:
    ZyrGeProfile();
    // Copies every ring; the copy has no parent.
    ZyrGeProfile(const ZyrGeProfile& other);
    // Copies every ring and keeps the parent.
    ZyrGeProfile& operator=(const ZyrGeProfile& other);
    ~ZyrGeProfile() override;

    // The rings and extents of another profile; eBadArgument for an object that is no profile.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;

    // Takes the ring over and appends it; a null ring is refused.
    [[nodiscard]] Hsys::ErrorStatus addRing(ZyrGeRing* ring);
    int ringCount() const { return static_cast<int>(m_rings.size()); }
    // Null outside [0, ringCount()). The writable form marks the extents stale, since the ring
    // may be changed through it; it asserts nothing, so whoever changes a ring through it asserts
    // write on the profile's parent first.
    const ZyrGeRing* ring(int index) const;
    ZyrGeRing* ring(int index);
    void removeAllRings();

    // The sum of the rings' signed areas, leaving out rings whose area is within tol of zero.
    double area(double tol) const;
    // Valid when every ring is closed, has finite numbers, no segment shorter than the point
    // tolerance, and encloses an area wider than the point tolerance on average (twice its area
    // over its length). With checkCrossings also no two segments meet except neighbours at their
    // joint: no ring crosses or touches itself or another ring. A profile without rings is valid.
    bool isValidProfile(bool checkCrossings) const;

    // Scales about the origin; zero or non-finite factors are refused and change nothing. A
    // negative factor mirrors, as transformBy does.
    Hsys::ErrorStatus scale(double xFactor, double yFactor);
    // Scales so that the extents rectangle becomes width by height (taken without sign), keeping
    // its left-bottom corner. Exact for lines; with arcs, which stay circular, met within the point
    // tolerance where a few rounds of scaling reach it. Refused for a zero size, or a profile whose
    // rectangle has no width or no height.
    Hsys::ErrorStatus setExtent(double width, double height);
    // Every ring moves with the matrix (see ZyrGeSegment2d::transformBy). A mirroring matrix
    // would turn every ring's sense, so the rings are reversed after it: outlines stay positive
    // and holes negative.
    void transformBy(const HsGeMatrix3d& matrix);

    // After ZyrImpObj's fields: the profile's version word, the rings, and each segment's start,
    // end and bulge; the extents are not filed. A reader checks every count against the bytes that
    // are left and changes the profile only when all was read; a version above the current one is
    // refused with eNewerVersion (Zyr::bdfReadVersion). Nested in another object's stream, a
    // profile goes through Zyr::writeObject and Zyr::readObject.
    [[nodiscard]] Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    [[nodiscard]] Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;

    // The extents rectangle as last refreshed, arcs included; all 0 for a profile without rings.
    double left() const { return m_left; }
    double top() const { return m_top; }
    double right() const { return m_right; }
    double bottom() const { return m_bottom; }
    // True after any change of the geometry until updateExtents runs.
    bool isExtentsStale() const { return m_extentsStale; }
    void updateExtents();

private:
    // This level's own fields, after its base's and its version word.
    Hsys::ErrorStatus bdfInOwnFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutOwnFields(HsDbBdfFiler* filer) const;
    bool hasCrossings(const HsGeTol& tol) const;
    static Hsys::ErrorStatus readRing(HsDbBdfFiler* filer, ZyrGeRing& ring);

    std::vector<std::unique_ptr<ZyrGeRing>> m_rings;
    double m_left = 0.0;
    double m_top = 0.0;
    double m_right = 0.0;
    double m_bottom = 0.0;
    bool m_extentsStale = true;
};
