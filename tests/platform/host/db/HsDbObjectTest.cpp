// The open protocol: readers and writers, upgrades, erased objects, assertions, hand-over, and
// the scope-bound pointer that closes or deletes.
#include "platform/host/ut/HsAssertionViolation.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sstream>
#include <tuple>

namespace {

class HsDbObjectTest : public testing::Test {
protected:
    HsDbDatabase db;
    const HsDbObjectId id = addGadget(db);
};

TEST_F(HsDbObjectTest, readersShareAWriterIsAloneAndOpensMoveBetweenThem) {
    HsDbObject* first = nullptr;
    HsDbObject* second = nullptr;
    HsDbObject* other = nullptr;
    ASSERT_EQ(hsdbOpenObject(first, id, HsDb::kForRead), Hsys::eSuccess);
    ASSERT_EQ(hsdbOpenObject(second, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_EQ(first, second) << "an object lives once in memory";
    EXPECT_EQ(hsdbOpenObject(other, id, HsDb::kForNotify), Hsys::eWasOpenForRead);
    EXPECT_EQ(first->upgradeOpen(), Hsys::eWasOpenForRead) << "a second reader holds it";
    EXPECT_EQ(second->close(), Hsys::eSuccess);
    EXPECT_EQ(hsdbOpenObject(other, id, HsDb::kForWrite), Hsys::eWasOpenForRead);

    EXPECT_EQ(first->downgradeOpen(), Hsys::eNotOpenForWrite);
    ASSERT_EQ(first->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(first->upgradeOpen(), Hsys::eAlreadyWritable);
    EXPECT_EQ(hsdbOpenObject(other, id, HsDb::kForRead), Hsys::eWasOpenForWrite);
    EXPECT_EQ(hsdbOpenObject(other, id, HsDb::kForWrite), Hsys::eWasOpenForWrite);
    EXPECT_EQ(first->downgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(first->close(), Hsys::eSuccess);
    EXPECT_FALSE(first->isReadEnabled()) << "downgraded means exactly one read open";
    EXPECT_EQ(first->upgradeOpen(), Hsys::eNotOpenForRead);
    EXPECT_EQ(first->close(), Hsys::eNotOpenForRead) << "closed once too often";
}

TEST_F(HsDbObjectTest, openStatusesForEveryKindOfBadId) {
    HsDbObjectId dangling;
    ASSERT_EQ(db.getHsDbObjectId(dangling, true, 9999), Hsys::eSuccess);
    const std::tuple<const char*, HsDbObjectId, Hsys::ErrorStatus> cases[] = {
        {"null id", HsDbObjectId(), Hsys::eNullId},
        {"handle without object", dangling, Hsys::eKeyNotFound},
        {"a layer is no gadget", db.currentLayerId(), Hsys::eWrongClass},
        {"a gadget", id, Hsys::eSuccess},
    };
    TestGadget sentinel;
    for (const auto& [what, badId, expected] : cases) {
        TestGadget* gadget = &sentinel;
        EXPECT_EQ(hsdbOpenObject(gadget, badId, HsDb::kForRead), expected) << what;
        EXPECT_EQ(gadget == nullptr, expected != Hsys::eSuccess) << what;
        if (gadget != nullptr)
            gadget->close();
    }
    EXPECT_FALSE(dangling.isValid());
    EXPECT_EQ(dangling.objectClass(), nullptr);
}

TEST_F(HsDbObjectTest, erasedObjectsOpenOnlyWithTheFlagAndComeBackWhenUnerased) {
    TestGadget* gadget = nullptr;
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_EQ(gadget->erase(), Hsys::eNotOpenForWrite);
    ASSERT_EQ(gadget->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(gadget->erase(), Hsys::eSuccess);
    gadget->close();

    EXPECT_TRUE(id.isErased());
    EXPECT_TRUE(id.isValid()) << "an erased object stays behind its id";
    EXPECT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eWasErased);
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForWrite, true), Hsys::eSuccess);
    EXPECT_EQ(gadget->erase(false), Hsys::eSuccess);
    gadget->close();
    EXPECT_FALSE(id.isErased());
}

TEST_F(HsDbObjectTest, writesNeedAWriteOpenAndMarkTheObjectModifiedUntilClose) {
    TestGadget* gadget = nullptr;
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_THROW(gadget->setCount(3), HsAssertionViolation);
    EXPECT_THROW(gadget->assertNotifyEnabled(), HsAssertionViolation);
    EXPECT_EQ(gadget->count, 0) << "the refused write changed nothing";
    gadget->close();
    EXPECT_THROW(gadget->assertReadEnabled(), HsAssertionViolation) << "closed";
    EXPECT_THAT([&] { gadget->assertWriteEnabled(); },
                testing::ThrowsMessage<HsAssertionViolation>(
                    "TestGadget(" + std::to_string(id.handle()) + ") is not open for write"));

    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForWrite), Hsys::eSuccess);
    EXPECT_FALSE(gadget->isModified());
    gadget->setCount(2);
    EXPECT_TRUE(gadget->isModified());
    gadget->close();
    EXPECT_FALSE(gadget->isModified());

    TestGadget loose;
    EXPECT_NO_THROW(loose.setCount(4)) << "an object in no database is always writable";
    EXPECT_EQ(loose.close(), Hsys::eNotInDatabase);
    EXPECT_EQ(loose.upgradeOpen(), Hsys::eAlreadyWritable);
}

TEST_F(HsDbObjectTest, handOverGivesIdAndOwnerToTheNewObject) {
    TestGadget* old = nullptr;
    ASSERT_EQ(hsdbOpenObject(old, id, HsDb::kForWrite), Hsys::eSuccess);
    auto* successor = new TestGadget;
    EXPECT_EQ(old->handOverTo(nullptr), Hsys::eNullPointer);
    EXPECT_EQ(old->handOverTo(old), Hsys::eAlreadyPresent);
    ASSERT_EQ(old->handOverTo(successor), Hsys::eSuccess);
    EXPECT_EQ(successor->ownerId(), db.modelSpaceId());
    EXPECT_EQ(successor->close(), Hsys::eSuccess) << "the new object is open as the old one was";
    delete old;
    EXPECT_EQ(HsDbObjectPointer<TestGadget>(id, HsDb::kForRead).object(), successor);
}

TEST_F(HsDbObjectTest, scopedPointerClosesWhatHasAnIdAndDeletesWhatHasNone) {
    HsDbObjectPointer<TestGadget>(id, HsDb::kForWrite)->setCount(7);
    {
        HsDbObjectPointer<TestGadget> gadget(id, HsDb::kForWrite);
        EXPECT_EQ(gadget.openStatus(), Hsys::eSuccess) << "the first pointer closed its object";
        EXPECT_EQ(gadget->count, 7);
        HsDbObjectPointer<HsDbBlockTableRecord> wrongClass(id, HsDb::kForRead);
        EXPECT_EQ(wrongClass.openStatus(), Hsys::eWrongClass);
        EXPECT_FALSE(wrongClass);
    }
    // A made object that is never added goes away with the pointer: the sanitizers see a leak
    // otherwise. One that is added on the way is closed instead.
    { HsDbObjectPointer<TestGadget> made(new TestGadget); }
    HsDbObjectId added;
    {
        HsDbObjectPointer<TestGadget> made(new TestGadget);
        ASSERT_EQ(db.addHsDbObject(added, made.object()), Hsys::eSuccess);
    }
    HsDbObjectPointer<TestGadget> reopened(added, HsDb::kForWrite);
    EXPECT_EQ(reopened.openStatus(), Hsys::eSuccess) << "closed, not deleted";
}

TEST(HsDbObjectId, ordersByHandleAndPrintsItsNumber) {
    HsDbDatabase db(HsDb::kEmptyDatabase, HsDb::kNoTransactions);
    HsDbObjectId low;
    HsDbObjectId high;
    ASSERT_EQ(db.getHsDbObjectId(high, true, 40), Hsys::eSuccess);
    ASSERT_EQ(db.getHsDbObjectId(low, true, 7), Hsys::eSuccess);
    EXPECT_LT(low, high);
    EXPECT_LT(HsDbObjectId(), low) << "null sorts first";
    HsDbObjectId again;
    EXPECT_EQ(db.getHsDbObjectId(again, false, 41), Hsys::eKeyNotFound);
    EXPECT_EQ(db.getHsDbObjectId(again, true, 0), Hsys::eNullId);
    std::ostringstream printed;
    printed << low << ' ' << HsDbObjectId();
    EXPECT_EQ(printed.str(), "7 0");
}

TEST(HsDbObjectDeathTest, deletingAnObjectTheDatabaseOwnsEndsTheProcess) {
    EXPECT_DEATH(
        {
            HsDbDatabase db;
            auto* gadget = new TestGadget;
            HsDbObjectId id;
            db.addHsDbObject(id, gadget);
            delete gadget;
        },
        "was deleted while its database owns it");
}

} // namespace
