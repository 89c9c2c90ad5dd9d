// Reference checks of audits: the verdict on each kind of bad id, the printed line, and lists that
// are counted and repaired.
#include "tests/platform/base/obj/ZyrSampleObjects.h"

#include "platform/base/relgraph/ZyrAuditUtilities.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"

#include <gtest/gtest.h>

namespace {

class ZyrAuditUtilitiesOn : public ::testing::Test {
protected:
    void SetUp() override {
        good = addClosed(database, new ZyrDbSampleRecord);
        erased = addClosed(database, new ZyrDbSampleRecord);
        entity = addClosed(database, new ZyrDbSampleShape);
        foreign = addClosed(other, new ZyrDbSampleRecord);
        ASSERT_EQ(database.getHsDbObjectId(missing, true, 4242), Hsys::eSuccess);
        ASSERT_EQ(HsDbObjectPointer<HsDbObject>(erased, HsDb::kForWrite)->erase(), Hsys::eSuccess);
    }

    HsDbDatabase database;
    HsDbDatabase other;
    HsDbObjectId good, erased, entity, foreign, missing;
};

TEST_F(ZyrAuditUtilitiesOn, everyKindOfBadReferenceHasItsVerdict) {
    HsDbObjectPointer<HsDbObject> owner(entity, HsDb::kForRead);
    HsRxClass* record = ZyrDbSampleRecord::desc();
    const struct {
        const char* name;
        HsDbObjectId id;
        int allowNull, allowErased;
        ZyrReferenceVerdict verdict;
    } cases[] = {
        {"good", good, 0, 0, kGoodReference},
        {"null", HsDbObjectId(), 0, 0, kNullReference},
        {"null allowed", HsDbObjectId(), 1, 0, kGoodReference},
        {"erased", erased, 0, 0, kErasedReference},
        {"erased allowed", erased, 0, 1, kGoodReference},
        {"no object", missing, 0, 0, kMissingReference},
        {"wrong class", entity, 0, 0, kWrongClassReference},
        {"another drawing", foreign, 0, 0, kForeignReference},
    };
    for (const auto& c : cases)
        EXPECT_EQ(
            Zyr::verifySymbolReference(owner.object(), c.id, record, c.allowNull, c.allowErased),
            c.verdict)
            << c.name;
    ZyrDbSampleRecord inNoDatabase;
    EXPECT_EQ(Zyr::verifySymbolReference(&inNoDatabase, foreign, record, 0, 0), kGoodReference);
    EXPECT_EQ(Zyr::verifySymbolReference(owner.object(), entity, nullptr, 0, 0), kGoodReference);
}

TEST_F(ZyrAuditUtilitiesOn, aBadReferenceIsPrintedAsOneLineAndAGoodOneNotAtAll) {
    HsDbObjectPointer<HsDbObject> owner(entity, HsDb::kForRead);
    HsDbAuditInfo check(false);
    EXPECT_EQ(ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(
                  &check, owner.object(), good, ZyrDbSampleRecord::desc()),
              kGoodReference);
    EXPECT_TRUE(check.lines().empty());
    EXPECT_EQ(ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(
                  &check, owner.object(), erased, ZyrDbSampleRecord::desc()),
              kErasedReference);
    ASSERT_EQ(check.lines().size(), 1u);
    const std::wstring expected = owner->describe() + L"  ZyrDbSampleRecord " +
                                  std::to_wstring(erased.handle()) + L"  is erased  not fixed";
    EXPECT_EQ(check.lines()[0], expected);
    EXPECT_EQ(check.numErrors(), 0) << "the caller counts";

    HsDbAuditInfo fix(true);
    EXPECT_EQ(ZyrAuditUtilities::verifyEntityReferenceAndPrintAuditError(
                  &fix, HsDbEntity::cast(owner.object()), good, nullptr),
              kWrongClassReference)
        << "a record is no entity";
    EXPECT_EQ(ZyrAuditUtilities::verifyEntityReferenceAndPrintAuditError(
                  &fix, HsDbEntity::cast(owner.object()), entity, ZyrDbSampleShape::desc()),
              kGoodReference);
    ASSERT_EQ(fix.lines().size(), 1u);
    EXPECT_NE(fix.lines()[0].find(L"is of another class  fixed"), std::wstring::npos);
}

TEST_F(ZyrAuditUtilitiesOn, aListIsCountedAndRepairedInOrderOnlyWhenAsked) {
    HsDbObjectPointer<HsDbObject> owner(entity, HsDb::kForRead);
    const std::vector<HsDbObjectId> list = {erased, good, HsDbObjectId(), missing, good, entity};
    const struct {
        std::vector<HsDbObjectId> before;
        int allowNull;
        bool fix;
        int bad;
        std::vector<HsDbObjectId> after;
    } cases[] = {
        {list, 0, false, 4, list},
        {list, 0, true, 4, {good, good}},
        {list, 1, true, 3, {good, HsDbObjectId(), good}},
        {{good, missing}, 0, true, 1, {good}}, // a single bad reference goes too
    };
    for (const auto& c : cases) {
        std::vector<HsDbObjectId> ids = c.before;
        EXPECT_EQ(ZyrAuditUtilities::verifySymbolReferences(
                      owner.object(), ids, ZyrDbSampleRecord::desc(), c.allowNull, 0, c.fix),
                  c.bad)
            << c.bad << " of " << c.before.size();
        EXPECT_EQ(ids, c.after) << c.bad << " of " << c.before.size();
    }
}

} // namespace
