// The white board's algorithm half: attaching and detaching with their statuses, the copy in force
// during transactions, the scope in which the board is valid, and the previews it allows.
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationBitmapCreator.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoardPtr.h"
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"
#include "platform/host/db/HsDbPolyline.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "platform/host/ut/HsutConsole.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

namespace {

using Classes = std::vector<HsRxClass*>;

class ZyrAreaCalculationWhiteBoardTest : public testing::Test {
protected:
    void SetUp() override {
        ZyrAreaCalculationTestModule::services();
        area = ZyrAreaCalculationAreaAlgorithm::desc();
        perimeter = ZyrAreaCalculationPerimeterAlgorithm::desc();
    }
    Classes attached() const {
        Classes classes;
        for (const ZyrAreaCalculationAlgorithm* algorithm : board.algorithmVector())
            classes.push_back(algorithm->isA());
        return classes;
    }

    HsRxClass* area = nullptr;
    HsRxClass* perimeter = nullptr;
    ZyrAreaCalculationWhiteBoard board;
};

TEST_F(ZyrAreaCalculationWhiteBoardTest, attachAndDetachKeepOrderAndAnswerTheirStatuses) {
    const std::tuple<bool, HsRxClass*, Hsys::ErrorStatus, Classes> steps[] = {
        {false, area, Hsys::eSuccess, {}},
        {false, nullptr, Hsys::eSuccess, {}},
        {true, perimeter, Hsys::eSuccess, {perimeter}},
        {true, area, Hsys::eSuccess, {perimeter, area}},
        {true, area, Hsys::eDuplicateName, {perimeter, area}},
        {true, ZyrDatabaseDataZyrAreaCalculationBase::desc(), Hsys::eWrongClass, {perimeter, area}},
        {true, nullptr, Hsys::eWrongClass, {perimeter, area}},
        {false, ZyrAreaCalculationAlgorithm::desc(), Hsys::eNameNotFound, {perimeter, area}},
        {false, perimeter, Hsys::eSuccess, {area}},
        {true, perimeter, Hsys::eSuccess, {area, perimeter}},
        {false, nullptr, Hsys::eSuccess, {}}};
    for (const auto& [attach, cls, status, after] : steps) {
        EXPECT_EQ(attach ? board.attachAlgorithm(cls) : board.detachAlgorithm(cls), status)
            << (cls != nullptr ? cls->name() : L"null");
        EXPECT_EQ(attached(), after);
    }
    EXPECT_FALSE(board.imp()->valid()) << "attaching needs no valid board";
}

TEST_F(ZyrAreaCalculationWhiteBoardTest, operationsWorkOnTheCopyInForceDuringTransactions) {
    ASSERT_EQ(board.attachAlgorithm(area), Hsys::eSuccess);
    ZyrAreaCalculationWhiteBoardImp* own = board.imp();
    for (const bool commit : {false, true}) {
        board.startTransaction();
        EXPECT_NE(board.imp(), own);
        ASSERT_EQ(board.attachAlgorithm(perimeter), Hsys::eSuccess);
        board.validate();
        EXPECT_EQ(own->algorithmVector().size(), 1u);
        commit ? board.endTransaction() : board.abortTransaction();
        EXPECT_EQ(board.imp(), own);
        EXPECT_EQ(own->valid(), commit);
    }
    EXPECT_EQ(attached(), (Classes{area, perimeter}));
    std::unique_ptr<ZyrTransactable> copy(board.clone());
    EXPECT_EQ(static_cast<ZyrAreaCalculationWhiteBoard&>(*copy).algorithm(perimeter),
              board.algorithm(perimeter));

    // Reset makes the board stale and keeps the algorithms.
    board.reset();
    EXPECT_FALSE(own->valid());
    EXPECT_EQ(attached(), (Classes{area, perimeter}));
}

TEST_F(ZyrAreaCalculationWhiteBoardTest, boardIsValidOnlyInTheScopeOfAPointer) {
    ZyrAreaCalculationWhiteBoardImp* imp =
        ZyrAreaCalculationTestModule::services().whiteBoard()->imp();
    EXPECT_FALSE(imp->valid());
    {
        ZyrAreaCalculationWhiteBoardPtr outer;
        EXPECT_EQ(outer->imp(), imp);
        EXPECT_TRUE(imp->valid());
        { ZyrAreaCalculationWhiteBoardPtr inner; }
        EXPECT_FALSE(imp->valid()) << "nested pointers are not counted";
    }
}

class CountingService : public ZyrAreaCalculationBaseService {
public:
    ZyrBitmapHandle bitmap(HsDbEntity*, const HsDbObjectId&, unsigned int, unsigned int,
                           unsigned int) override {
        ++calls;
        return this;
    }
    int calls = 0;
};

TEST_F(ZyrAreaCalculationWhiteBoardTest, previewsAreMadeOnlyForEnabledRepresentations) {
    CountingService service;
    HsRxDictionary& services = *HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
    services.atPut(ZyrAreaCalculationBaseService::serviceName(), &service);
    const ZyrAreaCalculationBitmapCreator creator(&board);
    services.remove(ZyrAreaCalculationBaseService::serviceName());

    HsDbPolyline outline;
    EXPECT_EQ(creator.bitmap(&outline, area), nullptr) << "nothing is enabled";
    EXPECT_EQ(creator.bitmap(nullptr, area), nullptr);
    EXPECT_EQ(creator.bitmap(&outline, nullptr), nullptr);
    EXPECT_EQ(ZyrAreaCalculationBitmapCreator(nullptr).bitmap(&outline, area), nullptr);
    EXPECT_EQ(service.calls, 0);

    // A board without representations answers its defaults.
    EXPECT_EQ(board.currentConfigPairId(nullptr, area), 4294967295u);
    EXPECT_EQ(board.colorDepth(nullptr), 8u);
}

TEST_F(ZyrAreaCalculationWhiteBoardTest, dumpListsTheAttachedAlgorithms) {
    ASSERT_EQ(board.attachAlgorithm(perimeter), Hsys::eSuccess);
    ASSERT_EQ(board.attachAlgorithm(area), Hsys::eSuccess);
    HsutConsoleCapture console;
    board.dump();
    EXPECT_EQ(console.text(), L"\nApplied algorithms"
                              L"\n    0. ZyrAreaCalculationPerimeterAlgorithm"
                              L"\n    1. ZyrAreaCalculationAreaAlgorithm"
                              L"\nUsed entity views"
                              L"\n\n Database map  is empty...\n");
}

} // namespace
