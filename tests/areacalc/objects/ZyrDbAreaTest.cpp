// Areas in a drawing: filed through a drawing file, measured, sized, scaled, copied, audited and
// summarised.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "platform/base/dict/ZyrDict.h"
#include "platform/base/obj/ZyrExtentsOptions.h"
#include "platform/base/obj/ZyrScaleInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbPolyline.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"
#include "platform/host/ge/HsGePlane.h"

#include <cmath>
#include <numbers>

namespace {

using ZyrDbAreas = ZyrAreaDrawing;
using Options = ZyrExtentsOptions;

// A 10 by 8 rectangle with a 2 by 2 square hole.
ZyrGeProfile* rectangleWithHole() {
    return ZyrAreaDrawing::profileOf(
        {{{0, 0}, {10, 0}, {10, 8}, {0, 8}}, {{1, 1}, {1, 3}, {3, 3}, {3, 1}}});
}

// Width and height of the local extents, which are always 1 high.
std::pair<double, double> localSize(const ZyrImpArea& area) {
    HsGeBoundBlock3d block;
    EXPECT_EQ(area.getLocalExtents(block), Hsys::eSuccess);
    EXPECT_EQ(block.direction3(), HsGeVector3d::kZAxis);
    return {block.direction1().x, block.direction2().y};
}

TEST_F(ZyrDbAreas, aDrawingFileGivesBackNameStyleProfileAreaAndPerimeter) {
    const HsDbObjectId office = addAreaStyle(L"Office");
    std::unique_ptr<ZyrDbArea> kitchen(ZyrAreaDbOperations::sample(&database));
    ASSERT_EQ(kitchen->setName(L"Kitchen"), Hsys::eSuccess);
    ASSERT_EQ(kitchen->setStyleId(office), Hsys::eSuccess);
    const HsDbObjectId id = add(kitchen.release());

    const std::unique_ptr<HsDbDatabase> loaded = reloaded();
    HsDbObjectPointer<ZyrDbArea> area(there(*loaded, {id})[0], HsDb::kForRead);
    ASSERT_TRUE(area);
    EXPECT_EQ(area->name(), L"Kitchen");
    ZyrRmCString styleName;
    ASSERT_EQ(ZyrDict::recordName(area->styleId(), styleName), Hsys::eSuccess);
    EXPECT_EQ(styleName, L"Office");
    // Measured from the profile read back, so the arc and the hole must both return: a 10 by 8
    // rectangle and three quarters of a circle of radius 4, less a triangle of base 7.5, height 6.
    EXPECT_NEAR(area->area(), 57.5 + 12.0 * std::numbers::pi, 1e-9);
    EXPECT_NEAR(area->perimeter(), 35.5 + 6.0 * std::numbers::pi + 2.0 * std::hypot(3.75, 6.0),
                1e-9);
}

TEST_F(ZyrDbAreas, anAreaWithoutProfileMeasuresNothing) {
    ZyrImpArea area;
    EXPECT_EQ(area.areaName(), L"Area");
    EXPECT_EQ(std::pair(area.area(), area.perimeter()), std::pair(0.0, 0.0));
    HsGeBoundBlock3d block({1, 2, 3}, {4, 0, 0}, {0, 5, 0}, {0, 0, 6});
    EXPECT_EQ(area.getLocalExtents(block), Hsys::eBadArgument);
    EXPECT_EQ(area.setLocalExtents(block, Options::sAcceptAll), Hsys::eBadArgument);
    EXPECT_EQ(area.getProfile(HsGePlane()), nullptr);
    EXPECT_EQ(area.getBaseCurve(), nullptr);
    EXPECT_EQ(area.getWorldExtents(block), Hsys::eSuccess);
    EXPECT_EQ(block.basePoint(), HsGePoint3d(1, 2, 3)) << "left as it was given";
}

TEST_F(ZyrDbAreas, holesCountInThePerimeterButNotInTheBaseCurve) {
    ZyrImpArea area;
    ASSERT_EQ(area.setProfile(rectangleWithHole()), Hsys::eSuccess);
    ASSERT_EQ(area.setEcs(HsGeMatrix3d::translation({5, 6, 0})), Hsys::eSuccess);
    EXPECT_DOUBLE_EQ(area.area(), 76.0);
    EXPECT_DOUBLE_EQ(area.perimeter(), 44.0);
    std::unique_ptr<HsDbEntity> curve(area.getBaseCurve());
    const auto* polyline = HsDbPolyline::cast(curve.get());
    ASSERT_NE(polyline, nullptr);
    EXPECT_EQ(polyline->numVerts(), 4u);
    EXPECT_TRUE(polyline->isClosed() && polyline->hasPlinegen());
    HsGePoint3d corner;
    ASSERT_EQ(polyline->getPointAt(2, corner), Hsys::eSuccess);
    EXPECT_EQ(corner, HsGePoint3d(15, 14, 0)) << "placed by the ECS";
    HsGeBoundBlock3d world;
    ASSERT_EQ(area.getWorldExtents(world), Hsys::eSuccess);
    EXPECT_EQ(world.basePoint(), HsGePoint3d(5, 6, 0));

    // The profile's copy is turned, but not moved, by the ECS.
    ASSERT_EQ(area.setEcs(HsGeMatrix3d::translation({100, 50, 0}) *
                          HsGeMatrix3d::rotation(std::numbers::pi / 2, HsGeVector3d::kZAxis)),
              Hsys::eSuccess);
    std::unique_ptr<ZyrGeProfile> copy(area.getProfile(HsGePlane()));
    copy->updateExtents();
    EXPECT_NEAR(copy->left(), -8.0, 1e-9) << "turned";
    EXPECT_NEAR(copy->top(), 10.0, 1e-9) << "not moved";
}

// Sizes of the 10 by 8 rectangle after a scale or a new extent.
TEST_F(ZyrDbAreas, scalesAndExtentsTakeWidthAndHeightWithoutSign) {
    const auto block = [](double x, double y, double z) {
        return HsGeBoundBlock3d({0, 0, 0}, {x, 0, 0}, {0, y, 0}, {0, 0, z});
    };
    const std::tuple<ZyrScaleInfo, HsGeBoundBlock3d, int, Hsys::ErrorStatus, double, double>
        cases[] = {
            {{-2, 3, 1}, {}, 0, Hsys::eSuccess, 20, 24},
            {{0.5, -0.25, -7}, {}, 0, Hsys::eSuccess, 5, 2},
            {{0, 1, 1}, {}, 0, Hsys::eBadArgument, 10, 8},
            {{}, block(-4, 2, 1), Options::sAcceptAll, Hsys::eSuccess, 4, 2},
            {{}, block(4, 2, 1), Options::sIgnoreX, Hsys::eSuccess, 10, 2},
            {{}, block(4, 2, 1), Options::sIgnoreY, Hsys::eSuccess, 4, 8},
            {{}, block(4, 2, 1), Options::sIgnoreZ, Hsys::eBadArgument, 10, 8},
            {{}, block(4, 2, -1), Options::sAcceptAll, Hsys::eBadArgument, 10, 8},
            {{}, block(0, 2, 1), Options::sAcceptAll, Hsys::eBadArgument, 10, 8},
            {{}, block(4, 1e-12, 1), Options::sAcceptAll, Hsys::eBadArgument, 10, 8},
        };
    for (std::size_t i = 0; i < std::size(cases); ++i) {
        const auto& [scale, extent, options, expected, expectedWidth, expectedHeight] = cases[i];
        ZyrImpArea area;
        ASSERT_EQ(area.setProfile(rectangle(10, 8)), Hsys::eSuccess);
        const bool byExtent = extent.direction3().z != 0.0; // the scale rows give no block
        EXPECT_EQ(byExtent ? area.setLocalExtents(extent, options) : area.scaleBy(scale), expected)
            << i;
        const auto [width, height] = localSize(area);
        EXPECT_NEAR(width, expectedWidth, 1e-9) << i;
        EXPECT_NEAR(height, expectedHeight, 1e-9) << i;
        EXPECT_GT(area.area(), 0.0) << i << ": a mirror must not make a hole of the outline";
    }
}

TEST_F(ZyrDbAreas, aCopyHasItsOwnProfileAndTheSameStyleAndName) {
    const HsDbObjectId office = addAreaStyle(L"Office");
    ZyrImpArea source;
    ZyrGeProfile* held = rectangleWithHole();
    ASSERT_EQ(source.setProfile(held), Hsys::eSuccess);
    EXPECT_EQ(source.setProfile(held), Hsys::eSuccess) << "keeps, and does not delete, its own";
    ASSERT_EQ(source.setStyleId(office), Hsys::eSuccess);
    EXPECT_EQ(source.setStyleId(HsDbObjectId::kNull), Hsys::eNullId);
    ASSERT_EQ(source.setAreaName(L"Store"), Hsys::eSuccess);
    ZyrImpArea copy;
    ASSERT_EQ(copy.copyFrom(&source), Hsys::eSuccess);
    EXPECT_EQ(std::pair(copy.areaName().str(), copy.styleId()),
              std::pair(std::wstring(L"Store"), office));
    ASSERT_NE(copy.profile(), held);
    EXPECT_EQ(copy.profile()->impParent(), &copy);
    EXPECT_DOUBLE_EQ(copy.area(), 76.0);
    ZyrImpAreaStyle style;
    EXPECT_EQ(copy.copyFrom(&style), Hsys::eBadArgument);
    ZyrObjReferenceMap references;
    ASSERT_EQ(copy.getReferencedObjects(references), Hsys::eSuccess);
    ASSERT_EQ(references.count(), 1);
    EXPECT_EQ(references.at(0)->id(), office);
}

TEST_F(ZyrDbAreas, anAuditRepairsAnErasedStyleOnlyWhenItMayFix) {
    for (const bool fix : {false, true}) {
        const HsDbObjectId office = addAreaStyle(fix ? L"Fixed" : L"Kept");
        const HsDbObjectId id = addArea(L"Hall", rectangle(4, 3), office);
        ASSERT_EQ(HsDbObjectPointer<ZyrDbAreaStyle>(office, HsDb::kForWrite)->erase(),
                  Hsys::eSuccess);
        HsDbObjectPointer<ZyrDbArea> area(id, fix ? HsDb::kForWrite : HsDb::kForRead);
        for (const int expectedErrors : {1, fix ? 0 : 1}) {
            HsDbAuditInfo info(fix);
            EXPECT_EQ(area->audit(&info), Hsys::eSuccess);
            EXPECT_EQ(info.numErrors(), expectedErrors) << fix;
            EXPECT_EQ(info.numFixes(), fix ? expectedErrors : 0) << fix;
        }
        EXPECT_EQ(area->styleId(), fix ? standardStyle : office);
    }
}

TEST_F(ZyrDbAreas, theSummaryShowsNameStyleAreaAndPerimeter) {
    // The last outline does not close, which makes no valid profile; its length still counts.
    auto* open = new ZyrGeProfile;
    auto* sides = new ZyrGeRing;
    ASSERT_EQ(sides->addSegment(new ZyrGeSegment2d({0, 0}, {3, 0})), Hsys::eSuccess);
    ASSERT_EQ(sides->addSegment(new ZyrGeSegment2d({3, 0}, {3, 4})), Hsys::eSuccess);
    ASSERT_EQ(open->addRing(sides), Hsys::eSuccess);
    const std::tuple<ZyrGeProfile*, const wchar_t*, const wchar_t*> cases[] = {
        {rectangleWithHole(), L"76.00 m\u00b2", L"44.00 m"},
        {nullptr, L"0.00 m\u00b2", L"0.00 m"},
        {open, L"Invalid outline", L"7.00 m"}};
    const HsDbObjectId office = addAreaStyle(L"Office");
    for (const auto& [profile, areaText, perimeterText] : cases) {
        HsDbObjectPointer<ZyrDbArea> area(addArea(L"Kitchen", profile, office), HsDb::kForRead);
        ZyrDesc desc(&database);
        area->areaImp()->summaryInfo(&desc);
        // Without modifiers the net rows repeat the gross ones.
        EXPECT_EQ(desc.lines(),
                  (std::vector<ZyrRmCString>{L"Name: Kitchen", L"Area Style: Office",
                                             L"Area: " + ZyrRmCString(areaText),
                                             L"Perimeter: " + ZyrRmCString(perimeterText),
                                             L"Net area: " + ZyrRmCString(areaText),
                                             L"Net perimeter: " + ZyrRmCString(perimeterText)}));
    }
}

} // namespace
