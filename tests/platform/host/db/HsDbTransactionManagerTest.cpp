// Transactions: what they open they own and close, and an abort puts every change back.
#include "platform/host/db/HsDbTransactionManager.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>

namespace {

class HsDbTransactionTest : public testing::Test {
protected:
    std::wstring labelOf(const HsDbObjectId& id) {
        HsDbObjectPointer<TestGadget> gadget(id, HsDb::kForRead, true);
        return gadget ? gadget->label : L"(cannot open)";
    }
    TestGadget* openForWrite(const HsDbObjectId& id) {
        HsDbObject* object = nullptr;
        EXPECT_EQ(tm->getObject(object, id, HsDb::kForWrite), Hsys::eSuccess);
        return TestGadget::cast(object);
    }

    HsDbDatabase db;
    HsDbTransactionManager* tm = db.transactionManager();
};

TEST_F(HsDbTransactionTest, aDatabaseWithoutTransactionsHasNoManager) {
    EXPECT_EQ(HsDbDatabase(HsDb::kStandardRecords, HsDb::kNoTransactions).transactionManager(),
              nullptr);
    ASSERT_NE(tm, nullptr);
    HsDbObject* object = nullptr;
    EXPECT_EQ(tm->getObject(object, db.modelSpaceId(), HsDb::kForRead), Hsys::eNoTransaction);
    EXPECT_EQ(tm->endTransaction(), Hsys::eNoTransaction);
    EXPECT_EQ(tm->abortTransaction(), Hsys::eNoTransaction);
}

TEST_F(HsDbTransactionTest, abortRestoresFieldsErasuresAndRemovesWhatWasAdded) {
    // Undone objects are told so while their fields come back.
    struct Watcher : TestGadget {
        Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
            sawUndoing = isUndoing();
            return TestGadget::bdfInFields(filer);
        }
        bool sawUndoing = false;
    };
    auto* watcher = new Watcher;
    watcher->label = L"Wohnen";
    HsDbObjectId kept;
    {
        HsDbObjectPointer<HsDbBlockTableRecord> space(db.modelSpaceId(), HsDb::kForWrite);
        ASSERT_EQ(space->appendHsDbEntity(kept, watcher), Hsys::eSuccess);
    }
    watcher->close();
    const HsDbObjectId erased = addGadget(db, L"Bad");
    tm->startTransaction();
    TestGadget* gadget = openForWrite(kept);
    EXPECT_FALSE(watcher->isUndoing());
    gadget->setLabel(L"Schlafen");
    gadget->setCount(4);
    gadget->setLabel(L"Essen");
    {
        // Changes through a plain open inside a transaction are undone all the same.
        HsDbObjectPointer<TestGadget> plain(erased, HsDb::kForWrite);
        ASSERT_EQ(plain->erase(), Hsys::eSuccess);
        TestGadget successor;
        EXPECT_EQ(plain->handOverTo(&successor), Hsys::eDoesNotApply);
    }
    const HsDbObjectId added = addGadget(db, L"Neu");

    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(tm->numActiveTransactions(), 0);
    HsDbObjectPointer<TestGadget> restored(kept, HsDb::kForWrite);
    ASSERT_EQ(restored.openStatus(), Hsys::eSuccess) << "the abort closed it";
    EXPECT_EQ(restored->label, L"Wohnen");
    EXPECT_EQ(restored->count, 0);
    EXPECT_TRUE(watcher->sawUndoing);
    EXPECT_FALSE(watcher->isUndoing());
    EXPECT_FALSE(erased.isErased());
    EXPECT_TRUE(added.isErased());
    HsDbObjectPointer<HsDbBlockTableRecord> space(db.modelSpaceId(), HsDb::kForRead);
    EXPECT_EQ(space->entityIds(), (std::vector<HsDbObjectId>{kept, erased}));
}

TEST_F(HsDbTransactionTest, endingTheOutermostTransactionClosesAndKeepsChanges) {
    const HsDbObjectId id = addGadget(db, L"alt");
    tm->startTransaction();
    HsDbObject* first = nullptr;
    ASSERT_EQ(tm->getObject(first, id, HsDb::kForRead), Hsys::eSuccess);
    TestGadget* second = openForWrite(id);
    EXPECT_EQ(first, second) << "upgraded in place";
    second->setLabel(L"neu");
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
    const HsDbObjectId id = addGadget(db, L"eins");
    tm->startTransaction();
    TestGadget* gadget = openForWrite(id);
    gadget->setLabel(L"zwei");
    tm->startTransaction();
    gadget->setLabel(L"drei");
    const HsDbObjectId inner = addGadget(db, L"innen");
    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(gadget->label, L"zwei");
    EXPECT_TRUE(gadget->isWriteEnabled()) << "the outer transaction still holds it";
    EXPECT_TRUE(inner.isErased());

    tm->startTransaction();
    gadget->setLabel(L"vier");
    ASSERT_EQ(tm->endTransaction(), Hsys::eSuccess);
    ASSERT_EQ(tm->abortTransaction(), Hsys::eSuccess);
    EXPECT_EQ(labelOf(id), L"eins") << "the outer abort undoes what the ended inner one did";
}

} // namespace
