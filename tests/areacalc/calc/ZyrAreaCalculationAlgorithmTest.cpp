// The area and perimeter algorithms: the records they make for areas and groups, their names from
// the module's texts, and the list of algorithms the service offers.
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbDatabase.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

ZyrGeRing* rectangle(double x0, double y0, double x1, double y1) {
    auto* ring = new ZyrGeRing;
    const HsGePoint2d corners[] = {{x0, y0}, {x1, y0}, {x1, y1}, {x0, y1}};
    for (int i = 0; i < 4; ++i)
        EXPECT_EQ(ring->addSegment(new ZyrGeSegment2d(corners[i], corners[(i + 1) % 4])),
                  Hsys::eSuccess);
    return ring;
}

TEST(ZyrAreaCalculationAlgorithm, recordsCarryTheValueOfAnAreaAndZeroForAGroup) {
    ZyrAreaCalculationTestModule::services();
    HsDbDatabase database;
    HsDbObjectId id;
    auto* area = new ZyrDbArea;
    ASSERT_EQ(database.addHsDbObject(id, area), Hsys::eSuccess);
    // A 4 by 3 room with a 1 by 1 shaft: area 11, perimeter 14 + 4.
    auto* profile = new ZyrGeProfile;
    ASSERT_EQ(profile->addRing(rectangle(0, 0, 4, 3)), Hsys::eSuccess);
    ASSERT_EQ(profile->addRing(rectangle(2, 1, 1, 2)), Hsys::eSuccess);
    ASSERT_EQ(area->setProfile(profile), Hsys::eSuccess);
    ASSERT_EQ(area->downgradeOpen(), Hsys::eSuccess);

    using Make = ZyrCalculationNodeData* (
        ZyrAreaCalculationAlgorithm::*)(HsDbEntity*, const ZyrAreaCalculationBitmapCreator*) const;
    const ZyrAreaCalculationAreaAlgorithm areaAlgorithm{};
    const ZyrAreaCalculationPerimeterAlgorithm perimeterAlgorithm{};
    const struct {
        const ZyrAreaCalculationAlgorithm& algorithm;
        Make make;
        const wchar_t* className;
        const wchar_t* grossName;
        const wchar_t* netName;
        double value;
    } cases[] = {
        {areaAlgorithm, &ZyrAreaCalculationAlgorithm::areaNodeData,
         L"ZyrAreaCalculationAreaAlgorithm", L"Area", L"Net area", 11},
        {areaAlgorithm, &ZyrAreaCalculationAlgorithm::areaGroupNodeData,
         L"ZyrAreaCalculationAreaAlgorithm", L"Area", L"Net area", 0},
        {perimeterAlgorithm, &ZyrAreaCalculationAlgorithm::areaNodeData,
         L"ZyrAreaCalculationPerimeterAlgorithm", L"Perimeter", L"Net perimeter", 18},
        {perimeterAlgorithm, &ZyrAreaCalculationAlgorithm::areaGroupNodeData,
         L"ZyrAreaCalculationPerimeterAlgorithm", L"Perimeter", L"Net perimeter", 0},
    };
    for (const auto& c : cases) {
        std::unique_ptr<ZyrCalculationNodeData> data((c.algorithm.*c.make)(area, nullptr));
        EXPECT_EQ(dynamic_cast<ZyrDecomposedCalculationNodeData*>(data.get()), nullptr);
        EXPECT_EQ(data->objectId, id);
        EXPECT_EQ(data->algorithmClassName, c.className);
        EXPECT_EQ(data->grossName, c.grossName);
        EXPECT_EQ(data->netName, c.netName);
        EXPECT_NEAR(data->grossValue, c.value, 1e-12) << c.className;
        EXPECT_EQ(data->netValue, data->grossValue);
    }
    area->close();

    ZyrRmCString areaName;
    ZyrRmCString perimeterName;
    areaAlgorithm.displayName(areaName);
    perimeterAlgorithm.displayName(perimeterName);
    EXPECT_EQ(areaName + L"/" + perimeterName, L"Area/Perimeter");
    EXPECT_EQ(areaAlgorithm.description(),
              ZyrAreaCalculationBaseApp::sStringFromResource(28982, false));
    EXPECT_EQ(perimeterAlgorithm.description(),
              ZyrAreaCalculationBaseApp::sStringFromResource(28983, false));
}

TEST(ZyrAreaCalculationAlgorithm, availableAlgorithmsAreAppendedAndSummarisedByDisplayName) {
    ZyrAreaCalculationTestModule::services();
    HsRxClass* const area = ZyrAreaCalculationAreaAlgorithm::desc();
    HsRxClass* const perimeter = ZyrAreaCalculationPerimeterAlgorithm::desc();
    std::vector<HsRxClass*> classes{nullptr};
    ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(classes);
    EXPECT_EQ(classes,
              (std::less<>()(area, perimeter) ? std::vector<HsRxClass*>{nullptr, area, perimeter}
                                              : std::vector<HsRxClass*>{nullptr, perimeter, area}));

    ZyrDesc summary;
    ZyrAreaCalculationAlgorithm::summaryAlgorithms(&summary, {perimeter, area});
    EXPECT_EQ(summary.lines(),
              (std::vector<ZyrRmCString>{L"Calculations: Perimeter", L"Calculations: Area"}));
    ZyrDesc none;
    ZyrAreaCalculationAlgorithm::summaryAlgorithms(&none, {});
    EXPECT_TRUE(none.rows().empty());
}

} // namespace
