// The area and perimeter algorithms: the records they make for areas and groups, and their names
// and summary from the module's texts.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "platform/base/summary/ZyrDesc.h"

#include <memory>

namespace {

using ZyrAreaCalculationAlgorithmTest = ZyrAreaDrawing;

TEST_F(ZyrAreaCalculationAlgorithmTest, recordsCarryTheValueOfAnAreaAndZeroForAGroup) {
    // A 4 by 3 room with a 1 by 1 shaft: area 11, perimeter 14 + 4.
    const HsDbObjectId id = addArea(
        L"Room", profileOf({{{0, 0}, {4, 0}, {4, 3}, {0, 3}}, {{2, 1}, {1, 1}, {1, 2}, {2, 2}}}));
    HsDbObjectPointer<ZyrDbArea> area(id, HsDb::kForRead);
    using Algorithm = ZyrAreaCalculationAlgorithm;
    const ZyrAreaCalculationAreaAlgorithm areaCalc{};
    const ZyrAreaCalculationPerimeterAlgorithm perimeterCalc{};
    const std::tuple<const Algorithm&, const wchar_t*, const wchar_t*, const wchar_t*, double>
        cases[] = {{areaCalc, L"ZyrAreaCalculationAreaAlgorithm", L"Area", L"Net area", 11},
                   {perimeterCalc, L"ZyrAreaCalculationPerimeterAlgorithm", L"Perimeter",
                    L"Net perimeter", 18}};
    for (const auto& [algorithm, className, grossName, netName, areaValue] : cases)
        for (const auto& [make, value] : {std::pair(&Algorithm::areaNodeData, areaValue),
                                          {&Algorithm::areaGroupNodeData, 0.0}}) {
            std::unique_ptr<ZyrCalculationNodeData> data((algorithm.*make)(area.object(), nullptr));
            EXPECT_EQ(dynamic_cast<ZyrDecomposedCalculationNodeData*>(data.get()), nullptr);
            EXPECT_EQ(std::tuple(data->objectId, data->algorithmClassName.str(),
                                 data->grossName.str(), data->netName.str()),
                      std::tuple(id, std::wstring(className), std::wstring(grossName),
                                 std::wstring(netName)));
            EXPECT_NEAR(data->grossValue, value, 1e-12) << className;
            EXPECT_EQ(data->netValue, data->grossValue);
        }

    ZyrRmCString areaName;
    ZyrRmCString perimeterName;
    areaCalc.displayName(areaName);
    perimeterCalc.displayName(perimeterName);
    EXPECT_EQ(areaName + L"/" + perimeterName, L"Area/Perimeter");
    EXPECT_EQ(areaCalc.description(), ZyrAreaCalculationBaseApp::sStringFromResource(28982, false));
    EXPECT_EQ(perimeterCalc.description(),
              ZyrAreaCalculationBaseApp::sStringFromResource(28983, false));

    ZyrDesc summary;
    Algorithm::summaryAlgorithms(&summary, {perimeterAlgorithm(), areaAlgorithm()});
    EXPECT_EQ(summary.lines(),
              (std::vector<ZyrRmCString>{L"Calculations: Perimeter", L"Calculations: Area"}));
    ZyrDesc none;
    Algorithm::summaryAlgorithms(&none, {});
    EXPECT_TRUE(none.rows().empty());
}

} // namespace
