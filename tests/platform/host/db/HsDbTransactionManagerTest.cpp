// Transactions: what they open they own and close, and an abort puts every change back.
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>

namespace {

class HsDbTransactionTest : public testing::Test {
protected:
    HsDbObjectId addGadget(const wchar_t* label) {
        HsDbObjectPointer<HsDbBlockTableRecord> space(db.modelSpaceId(), HsDb::kForWrite);
        auto* gadget = new TestGadget;
        gadget->label = label;
        HsDbObjectId id;
        EXPECT_EQ(space->appendHsDbEntity(id, gadget), Hsys::eSuccess);
        gadget->close();
        return id;
    }
    std::wstring labelOf(const HsDbObjectId& id) {
        HsDbObjectPointer<TestGadget> gadget(id, HsDb::kForRead, true);
        return gadget ? gadget->label : L"(cannot open)";
    }

    HsDbDatabase db;
    HsDbTransactionManager* tm = db.transactionManager();
};

TEST_F(HsDbTransactionTest, aDatabaseWithoutTransactionsHasNoManager) {
    HsDbDatabase plain(HsDb::kStandardRecords, HsDb::kNoTransactions);
    EXPECT_EQ(plain.transactionManager(), nullptr);
    ASSERT_NE(tm, nullptr);
    HsDbObject* object = nullptr;
    EXPECT_EQ(tm->getObject(object, db.modelSpaceId(), HsDb::kForRead), Hsys::eNoTransaction);
    EXPECT_EQ(tm->endTransaction(), Hsys::eNoTransaction);
    EXPECT_EQ(tm->abortTransaction(), Hsys::eNoTransaction);
}

TEST_F(HsDbTransactionTest, abortRestoresFieldsErasuresAndRemovesWhatWasAdded) {
    const HsDbObjectId kept = addGadget(L"Wohnen");
    const HsDbObjectId erased = addGadget(L"Bad");
    tm->startTransaction();
    HsDbObject* object = nullptr;
    ASSERT_EQ(tm->getObject(object, kept, HsDb::kForWrite), Hsys::eSuccess);
    auto* gadget = TestGadget::cast(object);
    gadget->setLabel(L"Schlafen");
    gadget->setCount(4);
    gadget->setLabel(L"Essen");
    ASSERT_EQ(tm->getObject(object, erased, HsDb::kForWrite), Hsys::eSuccess);
    ASSERT_EQ(object->erase(), Hsys::eSuccess);
    const HsDbObjectId added = addGadget(L"Neu");
    const std::size_t entitiesBefore = 2;

    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(tm->numActiveTransactions(), 0);
    EXPECT_EQ(labelOf(kept), L"Wohnen");
    HsDbObjectPointer<TestGadget> restored(kept, HsDb::kForWrite);
    ASSERT_EQ(restored.openStatus(), Hsys::eSuccess) << "the abort closed it";
    EXPECT_EQ(restored->count, 0);
    EXPECT_FALSE(erased.isErased());
    EXPECT_TRUE(added.isErased());
    HsDbObjectPointer<HsDbBlockTableRecord> space(db.modelSpaceId(), HsDb::kForRead);
    EXPECT_EQ(space->entityIds().size(), entitiesBefore) << "model space is back as it was";
}

TEST_F(HsDbTransactionTest, endingTheOutermostTransactionClosesAndKeepsChanges) {
    const HsDbObjectId id = addGadget(L"alt");
    tm->startTransaction();
    HsDbObject* first = nullptr;
    HsDbObject* second = nullptr;
    ASSERT_EQ(tm->getObject(first, id, HsDb::kForRead), Hsys::eSuccess);
    ASSERT_EQ(tm->getObject(second, id, HsDb::kForWrite), Hsys::eSuccess) << "upgraded in place";
    EXPECT_EQ(first, second);
    TestGadget::cast(second)->setLabel(L"neu");
    ASSERT_EQ(tm->getObject(first, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_TRUE(first->isWriteEnabled()) << "a read request keeps the write open";
    EXPECT_EQ(tm->topTransaction()->openedObjects().size(), 1u);
    EXPECT_EQ(tm->getObject(first, id, HsDb::kForNotify), Hsys::eWasOpenForWrite);

    HsDbObject* outsider = nullptr;
    EXPECT_EQ(hsdbOpenObject(outsider, id, HsDb::kForRead), Hsys::eWasOpenForWrite);
    ASSERT_EQ(tm->endTransaction(), Hsys::eSuccess);
    EXPECT_EQ(labelOf(id), L"neu");
}

TEST_F(HsDbTransactionTest, anInnerAbortUndoesOnlyTheInnerChanges) {
    const HsDbObjectId id = addGadget(L"eins");
    tm->startTransaction();
    HsDbObject* object = nullptr;
    ASSERT_EQ(tm->getObject(object, id, HsDb::kForWrite), Hsys::eSuccess);
    TestGadget::cast(object)->setLabel(L"zwei");
    tm->startTransaction();
    TestGadget::cast(object)->setLabel(L"drei");
    const HsDbObjectId inner = addGadget(L"innen");
    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(TestGadget::cast(object)->label, L"zwei");
    EXPECT_TRUE(object->isWriteEnabled()) << "the outer transaction still holds it";
    EXPECT_TRUE(inner.isErased());

    tm->startTransaction();
    TestGadget::cast(object)->setLabel(L"vier");
    ASSERT_EQ(tm->endTransaction(), Hsys::eSuccess);
    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(labelOf(id), L"eins") << "the outer abort undoes what the ended inner one did";
}

TEST_F(HsDbTransactionTest, changesThroughPlainOpensAreUndoneAndHandOverIsRefused) {
    const HsDbObjectId id = addGadget(L"vorher");
    tm->startTransaction();
    {
        HsDbObjectPointer<TestGadget> gadget(id, HsDb::kForWrite);
        gadget->setLabel(L"nachher");
        TestGadget successor;
        EXPECT_EQ(gadget->handOverTo(&successor), Hsys::eDoesNotApply);
    }
    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(labelOf(id), L"vorher");
}

TEST_F(HsDbTransactionTest, objectsUndoneAreToldSoWhileTheirFieldsComeBack) {
    struct Watcher : TestGadget {
        Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
            sawUndoing = isUndoing();
            return TestGadget::bdfInFields(filer);
        }
        bool sawUndoing = false;
    };
    auto* watcher = new Watcher;
    HsDbObjectId id;
    ASSERT_EQ(db.addHsDbObject(id, watcher), Hsys::eSuccess);
    watcher->close();
    tm->startTransaction();
    HsDbObject* object = nullptr;
    ASSERT_EQ(tm->getObject(object, id, HsDb::kForWrite), Hsys::eSuccess);
    watcher->setCount(9);
    EXPECT_FALSE(watcher->isUndoing());
    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_TRUE(watcher->sawUndoing);
    EXPECT_FALSE(watcher->isUndoing());
    EXPECT_EQ(watcher->count, 0);
}

} // namespace
