// The calculation engine on small plans: the order of roots, the narrowing of algorithms down the
// tree of groups, the sums of members, modifier steps, the callback and the status of a call.
#include "tests/areacalc/calc/ZyrCalculationDrawing.h"

#include <gtest/gtest.h>

namespace {

using ZyrAreaCalculationEngineTest = ZyrCalculationDrawing;

TEST_F(ZyrAreaCalculationEngineTest, rootsAreGroupsThenAreasEachByWideCharacterValue) {
    const HsDbObjectId b = addRoom(L"B", 1, 1);
    const HsDbObjectId z = addGroup(L"Z", {}, {});
    const HsDbObjectId a = addRoom(L"A", 1, 1);
    const HsDbObjectId lower = addRoom(L"a", 1, 1);
    // Neither area nor group: left out without a trace and without a callback.
    const HsDbObjectId style = addAreaStyle(L"Plain");
    int callbacks = 0;
    EXPECT_EQ(calculate({lower, b, style, z, a}, [&] { ++callbacks; }), Hsys::eSuccess);
    EXPECT_EQ(rootNames(), (std::vector<std::wstring>{L"Z", L"A", L"B", L"a"}));
    EXPECT_EQ(callbacks, 4);
    for (const ZyrCalculationNode* root : stream.roots())
        EXPECT_EQ(root->parent, nullptr);
}

TEST_F(ZyrAreaCalculationEngineTest, statusIsThatOfTheEarlyExitOrOfTheLastOpen) {
    const HsDbObjectId a = addRoom(L"A", 2, 3);
    const HsDbObjectId b = addRoom(L"B", 1, 1);
    int callbacks = 0;
    ZyrAreaCalculationEngine engine;
    EXPECT_EQ(engine.calculate({a}, nullptr, nullptr, nullptr), Hsys::eNullPointer);
    EXPECT_EQ(calculate({}, [&] { ++callbacks; }), Hsys::eSuccess);
    EXPECT_EQ(callbacks, 0);
    EXPECT_TRUE(stream.roots().empty());

    // B passes the sorting, then is erased before the loop reaches it: A stays calculated, and
    // the failed open of the last object is the answer.
    const auto eraseB = [&] {
        if (++callbacks > 1)
            return;
        HsDbObject* object = nullptr;
        ASSERT_EQ(hsdbOpenObject(object, b, HsDb::kForWrite), Hsys::eSuccess);
        EXPECT_EQ(object->erase(), Hsys::eSuccess);
        object->close();
    };
    EXPECT_EQ(calculate({b, a}, eraseB), Hsys::eWasErased);
    EXPECT_EQ(rootNames(), std::vector<std::wstring>{L"A"});
    EXPECT_NEAR(data(*stream.roots()[0], areaAlgorithm())->netValue, 6.0, 1e-12);

    ASSERT_EQ(board->detachAlgorithm(nullptr), Hsys::eSuccess);
    EXPECT_EQ(calculate({a}), Hsys::eBadArgument);
    EXPECT_EQ(stream.roots().size(), 1u);
}

TEST_F(ZyrAreaCalculationEngineTest, allowedAlgorithmsNarrowDownTheTreeAndComeBackAfterIt) {
    const Classes areaOnly{areaAlgorithm()};
    const Classes none{};
    const HsDbObjectId s = addGroup(L"S", {}, {addRoom(L"s1", 1, 1)});
    const HsDbObjectId q = addGroup(L"Q", {}, {addRoom(L"q1", 1, 1)});
    const HsDbObjectId r = addGroup(L"R", {s}, {addRoom(L"r1", 1, 1)}, &none);
    const HsDbObjectId p = addGroup(L"P", {r, q}, {addRoom(L"p1", 1, 1)}, &areaOnly);
    const HsDbObjectId t = addGroup(L"T", {}, {addRoom(L"t1", 1, 1)});
    EXPECT_EQ(calculate({t, addRoom(L"u1", 1, 1), p}), Hsys::eSuccess);
    EXPECT_EQ(evaluatedAlgorithms(),
              (std::vector<std::wstring>{L"P:A", L"Q:A", L"q1:A", L"R:", L"S:", L"s1:", L"r1:",
                                         L"p1:A", L"T:AP", L"t1:AP", L"u1:AP"}));
    // Every node has its header, children point back to their parent.
    const ZyrCalculationNode& groupP = *stream.roots()[0];
    EXPECT_EQ(stream.nodeHeader(groupP)->objectId, p);
    EXPECT_EQ(stream.nodeHeader(groupP)->className, L"ZyrDbAreaGroup");
    for (const ZyrCalculationNode* child : groupP.children)
        EXPECT_EQ(child->parent, &groupP);
}

TEST_F(ZyrAreaCalculationEngineTest, groupSumsMembersNetAndThenRunsItsOwnModifiers) {
    const HsDbObjectId minus2 = addAreaModifier(L"Minus 2", L"_AREA_VALUE_ - 2");
    const HsDbObjectId half = addAreaModifier(L"Half", L"_AREA_VALUE_ * 0.5");
    const HsDbObjectId small = addRoom(L"Small", 2, 5);
    const HsDbObjectId large = addRoom(L"Large", 4, 5);
    attachModifiers(small, {minus2});
    attachModifiers(large, {minus2, half});
    const HsDbObjectId group = addGroup(L"G", {}, {small, large});
    attachModifiers(group, {half});
    std::vector<size_t> headersAtCallback;
    EXPECT_EQ(
        calculate({group}, [&] { headersAtCallback.push_back(stream.nodeHeaderVector().size()); }),
        Hsys::eSuccess);
    // Post-order: each area once its header exists, the group after both of them.
    EXPECT_EQ(headersAtCallback, (std::vector<size_t>{2, 3, 3}));

    const ZyrCalculationNode& g = *stream.roots()[0];
    ASSERT_EQ(g.children.size(), 2u);
    const std::tuple<const ZyrCalculationNode&, double, double, double,
                     std::vector<std::pair<double, double>>>
        cases[] = {
            {*g.children[0], 20, 9, 18, {{20, 18}, {18, 9}}}, // Large
            {*g.children[1], 10, 8, 14, {{10, 8}}},           // Small
            {g, 30, 8.5, 32, {{17, 8.5}}},
        };
    for (const auto& [node, areaGross, areaNet, perimeterGross, steps] : cases) {
        const ZyrCalculationNodeData* areaData = data(node, areaAlgorithm());
        const ZyrCalculationNodeData* perimeterData = data(node, perimeterAlgorithm());
        ASSERT_NE(areaData, nullptr);
        ASSERT_NE(perimeterData, nullptr);
        EXPECT_NEAR(areaData->grossValue, areaGross, 1e-12) << nameOf(node);
        EXPECT_NEAR(areaData->netValue, areaNet, 1e-12) << nameOf(node);
        // The modifiers do not list the perimeter: no step, net equals gross.
        EXPECT_NEAR(perimeterData->grossValue, perimeterGross, 1e-12) << nameOf(node);
        EXPECT_EQ(perimeterData->netValue, perimeterData->grossValue);
        EXPECT_TRUE(perimeterData->modifierBlocks.empty());
        ASSERT_EQ(areaData->modifierBlocks.size(), steps.size()) << nameOf(node);
        for (size_t i = 0; i < steps.size(); ++i) {
            EXPECT_NEAR(areaData->modifierBlocks[i].beforeValue, steps[i].first, 1e-12);
            EXPECT_NEAR(areaData->modifierBlocks[i].afterValue, steps[i].second, 1e-12);
            EXPECT_EQ(areaData->modifierBlocks[i].beforeName, L"_AREA_VALUE_");
        }
    }
    // One record per modifier object, however often it was applied, and every one closed.
    ASSERT_EQ(stream.modifierDataVector().size(), 2u);
    for (const ZyrModifierData* record : stream.modifierDataVector()) {
        ZyrDbAreaModifier* modifier = nullptr;
        EXPECT_EQ(ZyrDbAreaModifier::open(modifier, record->objectId, HsDb::kForWrite),
                  Hsys::eSuccess);
        if (modifier != nullptr)
            modifier->close();
    }
    EXPECT_EQ(stream.modifierData(data(g, areaAlgorithm())->modifierBlocks[0])->name, L"Half");
}

TEST_F(ZyrAreaCalculationEngineTest, areaInTwoGroupsMakesTwoNodesOnOneHeader) {
    const HsDbObjectId shared = addRoom(L"Shared", 3, 3);
    const HsDbObjectId first = addGroup(L"First", {}, {shared});
    const HsDbObjectId second = addGroup(L"Second", {}, {shared, addRoom(L"Own", 1, 2)});
    EXPECT_EQ(calculate({second, first}), Hsys::eSuccess);
    ASSERT_EQ(rootNames(), (std::vector<std::wstring>{L"First", L"Second"}));
    const ZyrCalculationNode& inFirst = *stream.roots()[0]->children.at(0);
    const ZyrCalculationNode& inSecond = *stream.roots()[1]->children.at(1);
    EXPECT_EQ(nameOf(inSecond), L"Shared");
    EXPECT_EQ(inFirst.headerIndex, inSecond.headerIndex);
    EXPECT_NE(inFirst.nodeDataIndices, inSecond.nodeDataIndices);
    EXPECT_EQ(stream.nodeHeaderVector().size(), 4u);
    EXPECT_NEAR(data(*stream.roots()[1], areaAlgorithm())->grossValue, 11.0, 1e-12);
}

} // namespace
