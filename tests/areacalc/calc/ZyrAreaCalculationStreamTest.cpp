// The calculation stream: its lookups against a search from the front of the tables, reset with
// its null roots, shared headers, and the exact console dump.
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/ut/HsutConsole.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

namespace {

class ZyrAreaCalculationStreamTest : public testing::Test {
protected:
    static HsDbObjectId id(std::uint64_t handle, HsDbDatabase& in) {
        HsDbObjectId result;
        EXPECT_EQ(in.getHsDbObjectId(result, true, handle), Hsys::eSuccess);
        return result;
    }
    HsDbObjectId id(std::uint64_t handle) { return id(handle, database); }
    static ZyrCalculationNode* node(int headerIndex, std::vector<int> dataIndices = {}) {
        return new ZyrCalculationNode{nullptr, headerIndex, {}, std::move(dataIndices)};
    }
    int header(const wchar_t* name, const HsDbObjectId& objectId) {
        return writer.appendNodeHeader(
            new ZyrCalculationNodeHeader{L"ZyrDbArea", objectId, name, L"", nullptr});
    }
    int header(const wchar_t* name, std::uint64_t handle, const wchar_t* description = L"") {
        return writer.appendNodeHeader(
            new ZyrCalculationNodeHeader{L"ZyrDbArea", id(handle), name, description, nullptr});
    }
    int data(std::uint64_t handle, const wchar_t* algorithm, double gross = 30, double net = 27) {
        auto* made = new ZyrCalculationNodeData;
        made->objectId = id(handle);
        made->algorithmClassName = algorithm;
        made->grossName = L"Area";
        made->grossValue = gross;
        made->netName = L"Net area";
        made->netValue = net;
        return writer.appendNodeData(made);
    }

    HsDbDatabase database;
    ZyrAreaCalculationStream stream;
    ZyrAreaCalculationStreamWriter writer{stream};
};

template <class Table> int searchFromTheFront(const Table& table, const HsDbObjectId& objectId) {
    const auto found = std::find_if(table.begin(), table.end(), [&](const auto* record) {
        return record->objectId == objectId;
    });
    return found != table.end() ? static_cast<int>(found - table.begin()) : -1;
}

TEST_F(ZyrAreaCalculationStreamTest, lookupsAnswerWhatASearchFromTheFrontAnswers) {
    // Two drawings give their objects the same handles: equal handles are still other objects.
    HsDbDatabase other;
    HsDbDatabase* const databases[] = {&database, &other};
    std::mt19937 random(20240611);
    // Runs of neighbouring handles and scattered ones, enough for the lookups to grow.
    std::uniform_int_distribution<std::uint64_t> handles(1, 1200);
    std::uniform_int_distribution<int> which(0, 1);
    const auto anyId = [&] { return id(handles(random), *databases[which(random)]); };
    // Two rounds: the lookups follow the tables through a reset as well.
    for (int round = 0; round < 2; ++round) {
        stream.reset();
        for (int i = 0; i < 3000; ++i) {
            header(L"area", anyId());
            writer.appendModifierData(new ZyrModifierData{L"m", L"", anyId(), L"x"});
        }
        for (HsDbDatabase* in : databases) {
            for (std::uint64_t handle = 1; handle <= 1205; ++handle) {
                const HsDbObjectId objectId = id(handle, *in);
                const int expectedHeader = searchFromTheFront(stream.nodeHeaderVector(), objectId);
                const int expectedModifier =
                    searchFromTheFront(stream.modifierDataVector(), objectId);
                int headerIndex = -1, modifierIndex = -1;
                EXPECT_EQ(stream.hasNodeHeaderFor(objectId, headerIndex), expectedHeader >= 0);
                EXPECT_EQ(stream.hasModifierDataFor(objectId, modifierIndex),
                          expectedModifier >= 0);
                EXPECT_EQ(headerIndex, expectedHeader) << handle;
                EXPECT_EQ(modifierIndex, expectedModifier) << handle;
            }
        }
    }
}

TEST_F(ZyrAreaCalculationStreamTest, objectPushedTwiceSharesItsHeaderButNotItsData) {
    header(L"Hall", 8);
    const int kitchen = header(L"Kitchen", 7);
    writer.appendRoot(node(kitchen, {data(7, L"Area")}));
    writer.appendRoot(node(kitchen, {data(7, L"Area"), data(7, L"Perimeter")}));

    const ZyrCalculationNode& first = *stream.roots()[0];
    const ZyrCalculationNode& second = *stream.roots()[1];
    EXPECT_EQ(stream.nodeHeader(first), stream.nodeHeader(second));
    EXPECT_EQ(stream.nNodeDatas(first), 1);
    EXPECT_EQ(stream.nNodeDatas(second), 2);
    EXPECT_NE(stream.nodeDataAt(first, 0), stream.nodeDataAt(second, 0));

    // Node data are found by object and by the exact algorithm name, first in table order.
    int index = -1;
    for (const auto& [algorithm, expected] :
         {std::pair(L"Area", 0), {L"Perimeter", 2}, {L"area", -1}, {L"Area ", -1}, {L"Are", -1}}) {
        index = -1;
        EXPECT_EQ(stream.hasNodeDataFor(id(7), algorithm, index), expected >= 0) << algorithm;
        EXPECT_EQ(index, expected) << algorithm;
    }
    EXPECT_FALSE(stream.hasNodeDataFor(id(8), L"Area", index));
}

// Counts its deletions, so that a record standing twice in the table is seen deleted once.
struct CountedData : ZyrCalculationNodeData {
    explicit CountedData(int& deletions) : deletions(deletions) {}
    ~CountedData() override { ++deletions; }
    int& deletions;
};

TEST_F(ZyrAreaCalculationStreamTest, resetEmptiesTheTablesAndLeavesNullRootsBehind) {
    int deletions = 0;
    auto* twice = new CountedData(deletions);
    writer.appendNodeData(twice);
    writer.appendNodeData(twice);
    writer.appendNodeData(nullptr);
    const int floor = header(L"Floor", 1);
    ZyrCalculationNode* root = node(floor);
    root->children = {node(header(L"Room", 2)), node(floor)};
    root->children[0]->children = {node(floor)};
    writer.appendRoot(root);
    writer.appendRoot(node(floor));
    writer.appendModifierData(new ZyrModifierData{L"Roof", L"", id(9), L"x"});

    stream.reset();
    EXPECT_EQ(deletions, 1);
    EXPECT_TRUE(stream.nodeHeaderVector().empty());
    EXPECT_TRUE(stream.nodeDataVector().empty());
    EXPECT_TRUE(stream.modifierDataVector().empty());
    EXPECT_EQ(stream.roots(), (ZyrAreaCalculationStream::NodeVector{nullptr, nullptr}));

    // Used again: new roots come behind the null slots.
    EXPECT_EQ(header(L"Floor", 1), 0);
    writer.appendRoot(node(0));
    EXPECT_EQ(stream.roots().size(), 3u);
}

TEST_F(ZyrAreaCalculationStreamTest, dumpPrintsTheForestWithValuesPiecesAndModifiers) {
    ZyrCalculationNode* floor = node(header(L"Floor", 1, L"Ground floor"), {data(1, L"Area")});
    auto* proof = new ZyrDecomposedCalculationNodeData;
    proof->grossName = L"Area";
    proof->grossValue = 30;
    proof->netName = L"Net area";
    proof->netValue = 27;
    proof->decomposedName = L"Area proof";
    proof->decomposedValue = 29.5;
    proof->units.push_back({L"A1", 29.5, {5.0, 11.8}, 0});
    proof->modifierBlocks = {{0, L"_AREA_VALUE_", 30, L"_AREA_VALUE_", 28.5},
                             {1, L"_AREA_VALUE_", 28.5, L"_AREA_VALUE_", 27}};
    writer.appendModifierData(
        new ZyrModifierData{L"Roof", L"Sloping", id(2), L"_AREA_VALUE_*0.95"});
    writer.appendModifierData(new ZyrModifierData{L"Cut", L"", id(3), L"_AREA_VALUE_-1.5"});
    floor->children.push_back(node(header(L"Room", 2), {writer.appendNodeData(proof)}));
    writer.appendRoot(floor);

    HsutConsoleCapture console;
    stream.dumpToHsysTxtWindow();
    EXPECT_EQ(console.text(), L"\nArea Calculation\n\n"
                              L"\nRoot node 1\n"
                              L"\nFloor(Ground floor)"
                              L"\nArea 30.000000\nNet area 27.000000"
                              L"\nRoom"
                              L"\nArea 30.000000\nNet area 27.000000"
                              L"\n    Area proof 29.500000"
                              L"\n    0. Roof (Sloping)  Before 30.000000 after 28.500000"
                              L"\n    1. Cut ()  Before 28.500000 after 27.000000"
                              L"\n");
    console.clear();
    ZyrAreaCalculationStream().dumpToHsysTxtWindow();
    EXPECT_EQ(console.text(), L"\nArea Calculation\n\n\n");
}

} // namespace
