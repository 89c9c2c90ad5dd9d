// The short road of values: single gross and net values of areas and group trees without a
// stream, where they agree with the engine and where they differ on purpose; and the sample area
// that style previews show.
#include "tests/areacalc/calc/ZyrCalculationDrawing.h"

#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "areacalc/calc/ZyrAreaGroupCalculationFunctor.h"
#include "areacalc/calc/ZyrAreaGroupDbOperations.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbLayerTable.h"

#include <numbers>

namespace {

using ZyrAreaGroupDbOperationsTest = ZyrCalculationDrawing;

double groupValue(Hsys::ErrorStatus (*operation)(const ZyrDbAreaGroup*, double&),
                  const HsDbObjectId& id, Hsys::ErrorStatus expected = Hsys::eSuccess,
                  double start = 0.0) {
    HsDbObjectPointer<ZyrDbAreaGroup> group(id, HsDb::kForRead);
    EXPECT_EQ(operation(group.object(), start), expected);
    return start;
}

TEST_F(ZyrAreaGroupDbOperationsTest, agreesWithTheEngineOnAnIntactTree) {
    const HsDbObjectId minus2 = addAreaModifier(L"Minus 2", L"_AREA_VALUE_ - 2");
    const HsDbObjectId half = addAreaModifier(L"Half", L"_AREA_VALUE_ * 0.5");
    const HsDbObjectId small = addRoom(L"Small", 2, 5);
    const HsDbObjectId large = addRoom(L"Large", 4, 5);
    const HsDbObjectId loose = addRoom(L"Loose", 3, 3);
    attachModifiers(small, {minus2});
    attachModifiers(large, {minus2, half});
    const HsDbObjectId inner = addGroup(L"Inner", {}, {small, large});
    const HsDbObjectId outer = addGroup(L"Outer", {inner}, {loose});
    attachModifiers(inner, {half});
    attachModifiers(outer, {minus2});
    ASSERT_EQ(calculate({outer}), Hsys::eSuccess);
    const ZyrCalculationNode& root = *stream.roots()[0];

    // Inner: (8 + 9) / 2 = 8.5 net of 30 gross; outer: 8.5 + 9 - 2 net of 39 gross.
    EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::area, outer), 39.0, 1e-12);
    EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::areaModified, outer), 15.5, 1e-12);
    EXPECT_NEAR(data(root, areaAlgorithm())->grossValue,
                groupValue(&ZyrAreaGroupDbOperations::area, outer), 1e-9);
    EXPECT_NEAR(data(root, areaAlgorithm())->netValue,
                groupValue(&ZyrAreaGroupDbOperations::areaModified, outer), 1e-9);
    EXPECT_NEAR(data(root, perimeterAlgorithm())->netValue,
                groupValue(&ZyrAreaGroupDbOperations::perimeterModified, outer), 1e-9);
    EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::perimeter, outer), 44.0, 1e-12);

    double value = -1.0;
    EXPECT_EQ(ZyrAreaDbOperations::areaModified(large, value), Hsys::eSuccess);
    EXPECT_NEAR(value, 9.0, 1e-12);
    EXPECT_EQ(ZyrAreaDbOperations::perimeter(large, value), Hsys::eSuccess);
    EXPECT_NEAR(value, 18.0, 1e-12);
}

TEST_F(ZyrAreaGroupDbOperationsTest, addsToTheResultAndLeavesOutWhatAGroupDoesNotAllow) {
    const Classes perimeterOnly{perimeterAlgorithm()};
    const HsDbObjectId a = addRoom(L"A", 4, 5);
    const HsDbObjectId hidden = addRoom(L"Hidden", 10, 10);
    const HsDbObjectId gone = addRoom(L"Gone", 7, 7);
    const HsDbObjectId narrow = addGroup(L"Narrow", {}, {hidden}, &perimeterOnly);
    const HsDbObjectId empty = addGroup(L"Empty", {}, {});
    const HsDbObjectId top = addGroup(L"Top", {narrow, empty}, {a, gone});
    erase(gone);

    EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::area, top, Hsys::eSuccess, 5.0), 25.0, 1e-12)
        << "added to the caller's running total; the narrow group and the erased area add nothing";
    EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::area, empty, Hsys::eSuccess, 3.0), 3.0,
                1e-12);
    EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::perimeter, top), 18.0 + 40.0, 1e-12);
    double untouched = 7.0;
    EXPECT_EQ(ZyrAreaGroupDbOperations::area(nullptr, untouched), Hsys::eNullPointer);
    EXPECT_EQ(untouched, 7.0);
}

TEST_F(ZyrAreaGroupDbOperationsTest, reportsOnlyTheLastMemberTriedAndOpensAreasByIdForRead) {
    const HsDbObjectId busy = addRoom(L"Busy", 1, 2);
    const HsDbObjectId good = addRoom(L"Good", 3, 4);
    const HsDbObjectId busyFirst = addGroup(L"BusyFirst", {}, {busy, good});
    const HsDbObjectId busyLast = addGroup(L"BusyLast", {}, {good, busy});
    {
        // A member open for write elsewhere cannot be opened for read: it costs its share only.
        HsDbObjectPointer<ZyrDbArea> writer(busy, HsDb::kForWrite);
        EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::area, busyFirst), 12.0, 1e-12);
        EXPECT_NEAR(groupValue(&ZyrAreaGroupDbOperations::area, busyLast, Hsys::eWasOpenForWrite),
                    12.0, 1e-12);
        double value = -1.0;
        EXPECT_EQ(ZyrAreaDbOperations::area(busy, value), Hsys::eWasOpenForWrite);
        EXPECT_EQ(value, -1.0);
    }
    double value = -1.0;
    EXPECT_EQ(ZyrAreaDbOperations::area(busyFirst, value), Hsys::eWrongClass)
        << "a group is no area";
    EXPECT_EQ(value, -1.0);
    EXPECT_EQ(ZyrAreaDbOperations::area(static_cast<ZyrDbArea*>(nullptr), value),
              Hsys::eNullPointer);
    EXPECT_EQ(ZyrAreaDbOperations::area(good, value), Hsys::eSuccess);
    EXPECT_NEAR(value, 12.0, 1e-12);
    EXPECT_EQ(HsDbObjectPointer<ZyrDbArea>(good, HsDb::kForWrite).openStatus(), Hsys::eSuccess)
        << "every value by id closes its area again";
}

TEST_F(ZyrAreaGroupDbOperationsTest, theFunctorSumsDirectAreasOfAllowingGroupsOnly) {
    const Classes perimeterOnly{perimeterAlgorithm()};
    const HsDbObjectId a = addRoom(L"A", 2, 2);
    const HsDbObjectId b = addRoom(L"B", 3, 3);
    const HsDbObjectId child = addGroup(L"Child", {}, {b});
    const HsDbObjectId narrow = addGroup(L"Narrow", {}, {b}, &perimeterOnly);
    const HsDbObjectId parent = addGroup(L"Parent", {child}, {a});
    ZyrAreaGroupCalculationFunctor sum(areaAlgorithm(), &ZyrDbArea::area);
    for (const HsDbObjectId& id : {parent, narrow, child}) {
        HsDbObjectPointer<ZyrDbAreaGroup> group(id, HsDb::kForRead);
        sum(group.object());
    }
    EXPECT_NEAR(sum.sum, 4.0 + 9.0, 1e-12) << "the parent's child group is not descended into";
}

TEST_F(ZyrAreaGroupDbOperationsTest,
       aFailingModifierKeepsTheValueOnBothRoadsButOnlyTheShortOneSaysSo) {
    const HsDbObjectId broken = addAreaModifier(L"Broken", L"_AREA_VALUE_ / 0");
    const HsDbObjectId half = addAreaModifier(L"Half", L"_AREA_VALUE_ * 0.5");
    const HsDbObjectId failsLast = addRoom(L"FailsLast", 4, 5);
    const HsDbObjectId failsFirst = addRoom(L"FailsFirst", 2, 5);
    attachModifiers(failsLast, {half, broken});
    attachModifiers(failsFirst, {broken, half});
    ASSERT_EQ(calculate({failsLast, failsFirst}), Hsys::eSuccess)
        << "the engine ignores the failure";
    double last = -1.0;
    double first = -1.0;
    EXPECT_NE(ZyrAreaDbOperations::areaModified(failsLast, last), Hsys::eSuccess);
    EXPECT_EQ(ZyrAreaDbOperations::areaModified(failsFirst, first), Hsys::eSuccess)
        << "a later success hides the earlier failure";
    EXPECT_NEAR(last, 10.0, 1e-12);
    EXPECT_NEAR(first, 5.0, 1e-12);
    // Roots are sorted by name: FailsFirst, then FailsLast.
    EXPECT_NEAR(data(*stream.roots()[0], areaAlgorithm())->netValue, first, 1e-12);
    EXPECT_NEAR(data(*stream.roots()[1], areaAlgorithm())->netValue, last, 1e-12);
}

TEST_F(ZyrAreaGroupDbOperationsTest, summariesShowModifiersAndTheNetValuesBesideTheGross) {
    const HsDbObjectId half = addAreaModifier(L"Half", L"_AREA_VALUE_ * 0.5");
    const HsDbObjectId room = addRoom(L"Room", 4, 5);
    attachModifiers(room, {half});
    const HsDbObjectId floor = addGroup(L"Floor", {}, {room});
    attachModifiers(floor, {half});
    const auto summary = [&](const HsDbObjectId& id) {
        HsDbObjectPointer<ZyrDbEntity> entity(id, HsDb::kForRead);
        ZyrDesc desc(&database);
        entity->imp()->summaryInfo(&desc);
        std::vector<std::wstring> lines;
        for (const ZyrRmCString& line : desc.lines())
            if (line.Find(L"Name") != 0 && line.Find(L"Style") < 0)
                lines.push_back(line.str());
        return lines;
    };
    EXPECT_EQ(summary(room), (std::vector<std::wstring>{
                                 L"Modifiers: Half", L"Area: 20.00 m\u00b2", L"Perimeter: 18.00 m",
                                 L"Net area: 10.00 m\u00b2", L"Net perimeter: 18.00 m"}));
    const std::vector<std::wstring> group = summary(floor);
    ASSERT_GE(group.size(), 4u);
    EXPECT_EQ(std::vector<std::wstring>(group.end() - 4, group.end()),
              (std::vector<std::wstring>{L"Area: 20.00 m\u00b2", L"Perimeter: 18.00 m",
                                         L"Net area: 5.00 m\u00b2", L"Net perimeter: 18.00 m"}))
        << "the group's modifier halves the sum of its members' net values";
}

TEST_F(ZyrAreaGroupDbOperationsTest, theSampleIsAnOutlineWithAnArcAndAHoleOnTheAreaLayer) {
    hsdbHostApplicationServices()->setWorkingDatabase(&database);
    std::unique_ptr<ZyrDbArea> sample(ZyrAreaDbOperations::sample(nullptr));
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
    ASSERT_NE(sample, nullptr);
    EXPECT_TRUE(sample->objectId().isNull());
    EXPECT_EQ(sample->styleId(), standardStyle);
    const ZyrGeProfile* profile = sample->profile();
    ASSERT_EQ(profile->ringCount(), 2);
    EXPECT_NEAR(profile->ring(0)->area(), 80.0 + 12.0 * std::numbers::pi, 1e-9);
    EXPECT_NEAR(profile->ring(1)->area(), -22.5, 1e-9);
    EXPECT_TRUE(profile->isValidProfile(true));
    HsDbObjectPointer<HsDbLayerTableRecord> layer(sample->layerId(), HsDb::kForRead);
    const wchar_t* name = nullptr;
    ASSERT_TRUE(layer);
    ASSERT_EQ(layer->getName(name), Hsys::eSuccess);
    EXPECT_STREQ(name, L"AREA");
}

} // namespace
