// The open protocol: readers and writers, upgrades, erased objects, assertions, hand-over, and
// the scope-bound pointer that closes or deletes.
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/db/HsDbProxyObject.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

using Hsys::ErrorStatus;

class HsDbObjectTest : public testing::Test {
protected:
    // A gadget in model space, closed.
    HsDbObjectId addGadget() {
        HsDbBlockTableRecord* space = nullptr;
        EXPECT_EQ(hsdbOpenObject(space, db.modelSpaceId(), HsDb::kForWrite), Hsys::eSuccess);
        auto* gadget = new TestGadget;
        HsDbObjectId id;
        EXPECT_EQ(space->appendHsDbEntity(id, gadget), Hsys::eSuccess);
        gadget->close();
        space->close();
        return id;
    }

    HsDbDatabase db;
};

TEST_F(HsDbObjectTest, readersShareAndAWriterIsAlone) {
    const HsDbObjectId id = addGadget();
    HsDbObject* first = nullptr;
    HsDbObject* second = nullptr;
    HsDbObject* writer = nullptr;
    ASSERT_EQ(hsdbOpenObject(first, id, HsDb::kForRead), Hsys::eSuccess);
    ASSERT_EQ(hsdbOpenObject(second, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_EQ(first, second) << "an object lives once in memory";
    EXPECT_EQ(hsdbOpenObject(writer, id, HsDb::kForWrite), Hsys::eWasOpenForRead);
    EXPECT_EQ(writer, nullptr);
    EXPECT_EQ(hsdbOpenObject(writer, id, HsDb::kForNotify), Hsys::eWasOpenForRead);

    EXPECT_EQ(first->close(), Hsys::eSuccess);
    EXPECT_EQ(hsdbOpenObject(writer, id, HsDb::kForWrite), Hsys::eWasOpenForRead)
        << "one reader is left";
    EXPECT_EQ(second->close(), Hsys::eSuccess);
    ASSERT_EQ(hsdbOpenObject(writer, id, HsDb::kForWrite), Hsys::eSuccess);

    HsDbObject* blocked = nullptr;
    EXPECT_EQ(hsdbOpenObject(blocked, id, HsDb::kForRead), Hsys::eWasOpenForWrite);
    EXPECT_EQ(hsdbOpenObject(blocked, id, HsDb::kForWrite), Hsys::eWasOpenForWrite);
    EXPECT_EQ(writer->close(), Hsys::eSuccess);
    EXPECT_EQ(writer->close(), Hsys::eNotOpenForRead) << "closed once too often";
}

TEST_F(HsDbObjectTest, upgradeAndDowngradeMoveBetweenReadAndWrite) {
    const HsDbObjectId id = addGadget();
    HsDbObject* object = nullptr;
    HsDbObject* other = nullptr;
    ASSERT_EQ(hsdbOpenObject(object, id, HsDb::kForRead), Hsys::eSuccess);
    ASSERT_EQ(hsdbOpenObject(other, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_EQ(object->upgradeOpen(), Hsys::eWasOpenForRead) << "a second reader holds it";
    other->close();

    EXPECT_EQ(object->downgradeOpen(), Hsys::eNotOpenForWrite);
    EXPECT_EQ(object->upgradeOpen(), Hsys::eSuccess);
    EXPECT_TRUE(object->isWriteEnabled());
    EXPECT_EQ(object->upgradeOpen(), Hsys::eAlreadyWritable);
    EXPECT_EQ(object->downgradeOpen(), Hsys::eSuccess);
    EXPECT_TRUE(object->isReadEnabled());
    EXPECT_FALSE(object->isWriteEnabled());
    EXPECT_EQ(object->close(), Hsys::eSuccess);
    EXPECT_FALSE(object->isReadEnabled()) << "downgraded means exactly one read open";
    EXPECT_EQ(object->upgradeOpen(), Hsys::eNotOpenForRead);
}

TEST_F(HsDbObjectTest, openStatusesForEveryKindOfBadId) {
    const HsDbObjectId gadgetId = addGadget();
    HsDbObjectId dangling;
    ASSERT_EQ(db.getHsDbObjectId(dangling, true, 9999), Hsys::eSuccess);
    struct Case {
        const char* what;
        HsDbObjectId id;
        ErrorStatus expected;
    };
    const Case cases[] = {
        {"null id", HsDbObjectId(), Hsys::eNullId},
        {"handle without object", dangling, Hsys::eKeyNotFound},
        {"a layer is no gadget", db.currentLayerId(), Hsys::eWrongClass},
        {"a gadget", gadgetId, Hsys::eSuccess},
    };
    TestGadget sentinel;
    for (const Case& c : cases) {
        TestGadget* gadget = &sentinel;
        EXPECT_EQ(hsdbOpenObject(gadget, c.id, HsDb::kForRead), c.expected) << c.what;
        EXPECT_EQ(gadget == nullptr, c.expected != Hsys::eSuccess) << c.what;
        if (gadget != nullptr)
            gadget->close();
    }
    EXPECT_FALSE(dangling.isValid());
    EXPECT_EQ(dangling.objectClass(), nullptr);
    EXPECT_EQ(gadgetId.objectClass(), TestGadget::desc());
}

TEST_F(HsDbObjectTest, erasedObjectsOpenOnlyWithTheFlagAndComeBackWhenUnerased) {
    const HsDbObjectId id = addGadget();
    TestGadget* gadget = nullptr;
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_EQ(gadget->erase(), Hsys::eNotOpenForWrite);
    ASSERT_EQ(gadget->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(gadget->erase(), Hsys::eSuccess);
    EXPECT_EQ(gadget->erase(), Hsys::eSuccess) << "erasing twice changes nothing";
    gadget->close();

    EXPECT_TRUE(id.isErased());
    EXPECT_TRUE(id.isValid()) << "an erased object stays behind its id";
    EXPECT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eWasErased);
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForWrite, true), Hsys::eSuccess);
    EXPECT_TRUE(gadget->isErased());
    EXPECT_EQ(gadget->erase(false), Hsys::eSuccess);
    gadget->close();
    EXPECT_FALSE(id.isErased());
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eSuccess);
    gadget->close();
}

TEST_F(HsDbObjectTest, assertionsThrowUnlessTheOpenAllowsIt) {
    const HsDbObjectId id = addGadget();
    TestGadget* gadget = nullptr;
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_NO_THROW(gadget->assertReadEnabled());
    EXPECT_THROW(gadget->setCount(3), HsAssertionViolation);
    EXPECT_THROW(gadget->assertNotifyEnabled(), HsAssertionViolation);
    EXPECT_EQ(gadget->count, 0) << "the refused write changed nothing";
    gadget->close();
    EXPECT_THROW(gadget->assertReadEnabled(), HsAssertionViolation) << "closed";

    try {
        gadget->assertWriteEnabled();
        FAIL() << "no assertion";
    } catch (const HsAssertionViolation& violation) {
        std::ostringstream expected;
        expected << "TestGadget(" << id << ") is not open for write";
        EXPECT_EQ(violation.what(), expected.str());
    }

    TestGadget loose;
    EXPECT_NO_THROW(loose.setCount(4)) << "an object in no database is always writable";
    EXPECT_EQ(loose.close(), Hsys::eNotInDatabase);
    EXPECT_EQ(loose.upgradeOpen(), Hsys::eAlreadyWritable);
    EXPECT_TRUE(loose.objectId().isNull());
    EXPECT_EQ(loose.database(), nullptr);
}

TEST_F(HsDbObjectTest, modifiedHoldsFromTheFirstWriteUntilClose) {
    const HsDbObjectId id = addGadget();
    TestGadget* gadget = nullptr;
    ASSERT_EQ(hsdbOpenObject(gadget, id, HsDb::kForWrite), Hsys::eSuccess);
    EXPECT_FALSE(gadget->isModified());
    gadget->setCount(2);
    EXPECT_TRUE(gadget->isModified());
    gadget->close();
    EXPECT_FALSE(gadget->isModified());
}

TEST_F(HsDbObjectTest, handOverGivesIdAndOwnerToTheNewObject) {
    const HsDbObjectId id = addGadget();
    TestGadget* old = nullptr;
    ASSERT_EQ(hsdbOpenObject(old, id, HsDb::kForWrite), Hsys::eSuccess);
    auto* successor = new TestGadget;
    EXPECT_EQ(old->handOverTo(nullptr), Hsys::eNullPointer);
    EXPECT_EQ(old->handOverTo(old), Hsys::eAlreadyPresent);
    ASSERT_EQ(old->handOverTo(successor), Hsys::eSuccess);

    EXPECT_TRUE(old->objectId().isNull());
    EXPECT_EQ(successor->objectId(), id);
    EXPECT_EQ(successor->ownerId(), db.modelSpaceId());
    EXPECT_TRUE(successor->isWriteEnabled());
    successor->close();
    delete old;

    TestGadget* reopened = nullptr;
    ASSERT_EQ(hsdbOpenObject(reopened, id, HsDb::kForRead), Hsys::eSuccess);
    EXPECT_EQ(reopened, successor);
    reopened->close();
}

TEST_F(HsDbObjectTest, scopedPointerClosesWhatHasAnIdAndDeletesWhatHasNone) {
    const HsDbObjectId id = addGadget();
    {
        HsDbObjectPointer<TestGadget> gadget(id, HsDb::kForWrite);
        ASSERT_EQ(gadget.openStatus(), Hsys::eSuccess);
        gadget->setCount(7);
    }
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
        made->setCount(3);
    }
    HsDbObjectPointer<TestGadget> reopened(added, HsDb::kForWrite);
    ASSERT_EQ(reopened.openStatus(), Hsys::eSuccess) << "closed, not deleted";
    EXPECT_EQ(reopened->count, 3);
}

TEST_F(HsDbObjectTest, aProxyPassesAnOpenOfEveryClassOnlyWhenAskedUntyped) {
    auto* proxy = new HsDbProxyObject(L"SomeoneElsesClass");
    HsDbObjectId id;
    ASSERT_EQ(db.addHsDbObject(id, proxy), Hsys::eSuccess);
    proxy->close();
    EXPECT_EQ(id.objectClass(), HsDbProxyObject::desc());
    HsDbObjectPointer<TestGadget> typed(id, HsDb::kForRead);
    EXPECT_EQ(typed.openStatus(), Hsys::eWrongClass);
    HsDbObjectPointer<HsDbObject> untyped(id, HsDb::kForRead);
    ASSERT_EQ(untyped.openStatus(), Hsys::eSuccess);
    EXPECT_EQ(HsDbProxyObject::cast(untyped.object())->originalClassName(), L"SomeoneElsesClass");
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
    ASSERT_EQ(db.getHsDbObjectId(again, false, 40), Hsys::eSuccess);
    EXPECT_EQ(again, high);
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
