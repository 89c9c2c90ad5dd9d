// Helpers shared by the sibling modules: texts, record names, summaries and standard records.
#include "platform/base/app/ZyrHdxEquipment.h"

#include "platform/base/obj/ZyrImpDictRecord.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbTextStyleTable.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "tests/platform/base/dict/ZyrDictTestRecords.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrHdxEquipment, multipleSubstReplacesEveryOccurrenceOnce) {
    const struct {
        const wchar_t* text;
        const wchar_t* from;
        const wchar_t* to;
        const wchar_t* expected;
    } cases[] = {
        {L"_V_*0.9+_V_", L"_V_", L"\u00b0\u00b0\u00b0\u00b0",
         L"\u00b0\u00b0\u00b0\u00b0*0.9+\u00b0\u00b0\u00b0\u00b0"},
        {L"aa", L"a", L"aa", L"aaaa"}, // inserted text is not searched again
        {L"aaa", L"aa", L"b", L"ba"},  // from the left, without overlaps
        {L"abc", L"", L"x", L"abc"},
        {L"x+x", L"x", L"", L"+"},
    };
    for (const auto& c : cases) {
        ZyrRmCString text(c.text);
        ZyrHdxEquipment::multipleSubst(text, c.from, c.to);
        EXPECT_EQ(text, c.expected) << c.text << " / " << c.from;
    }
}

class ZyrHdxEquipmentIn : public ::testing::Test {
protected:
    HsDbDatabase db;
    ZyrTestStyleDict styles{&db};
};

TEST_F(ZyrHdxEquipmentIn, setStringAssertsWriteOnTheParentOnlyForAChange) {
    ASSERT_TRUE(styles.isValid(true, true));
    HsDbObjectPointer<ZyrDbDictRecord> record(styles.standardRecord(), HsDb::kForRead);
    ZyrRmCString field = L"same";
    EXPECT_EQ(ZyrHdxEquipment::setString(record->recordImp(), L"same", field), Hsys::eSuccess);
    EXPECT_THROW(ZyrHdxEquipment::setString(record->recordImp(), L"new", field),
                 HsAssertionViolation);
    ASSERT_EQ(record->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(ZyrHdxEquipment::setString(record->recordImp(), L"new", field), Hsys::eSuccess);
    EXPECT_EQ(field, L"new");
    EXPECT_EQ(ZyrHdxEquipment::setString(nullptr, L"x", field), Hsys::eNullPointer);
}

TEST_F(ZyrHdxEquipmentIn, recordNamesStayParallelToTheirIdsAndBecomeSummaryRows) {
    EXPECT_FALSE(ZyrHdxEquipment::isRegularDictionaryInitialized(ZyrTestStyleDict::kName, &db));
    ASSERT_TRUE(styles.isValid(true, true));
    EXPECT_TRUE(ZyrHdxEquipment::isRegularDictionaryInitialized(ZyrTestStyleDict::kName, &db));
    EXPECT_FALSE(ZyrHdxEquipment::isRegularDictionaryInitialized(ZyrTestStyleDict::kName, nullptr));
    HsDbObjectId id; // an entry that is no dictionary
    HsDbObjectPointer<HsDbDictionary>(db.namedObjectsDictionaryId(), HsDb::kForWrite)
        ->setAt(L"ZYR_DISP_REPS", HsDbObjectPointer<ZyrTestStyle>(new ZyrTestStyle).object(), id);
    EXPECT_FALSE(ZyrHdxEquipment::isRegularDictionaryInitialized(L"ZYR_DISP_REPS", &db));
    ZyrRmCStringArray names{L"before"};
    EXPECT_EQ(ZyrHdxEquipment::convertToDictRecNames(
                  {styles.add(L"Office"), HsDbObjectId(), db.layerTableId()}, names),
              Hsys::eNullId);
    EXPECT_EQ(names, (ZyrRmCStringArray{L"before", L"Office", L"(none)", L"(invalid record)"}));
    ZyrDesc desc(&db);
    ZyrHdxEquipment::summaryInfoStringVector(&desc, L"Modifiers", {L"Tax", L"Plaster"});
    ZyrHdxEquipment::summaryInfoStringVector(&desc, L"Empty", {});
    EXPECT_EQ(desc.text(), L"Modifiers: Tax\nModifiers: Plaster\n");
}

TEST(ZyrHdxEquipment, standardRecordIdFindsTheRecordEveryDrawingHas) {
    HsDbDatabase db;
    const struct {
        HsRxClass* cls;
        ZyrHdxEquipment::TableGetter table;
        Hsys::ErrorStatus expected;
        HsDbObjectId id;
    } cases[] = {
        {HsDbLayerTableRecord::desc(), &HsDbDatabase::layerTableId, Hsys::eSuccess,
         db.currentLayerId()},
        {HsDbTextStyleTableRecord::desc(), &HsDbDatabase::textStyleTableId, Hsys::eSuccess,
         db.currentTextStyleId()},
        {HsDbBlockTableRecord::desc(), &HsDbDatabase::blockTableId, Hsys::eSuccess,
         db.modelSpaceId()},
        {HsDbLayerTableRecord::desc(), &HsDbDatabase::textStyleTableId, Hsys::eWrongClass, {}},
        {HsDbLayerTableRecord::desc(),
         &HsDbDatabase::namedObjectsDictionaryId,
         Hsys::eWrongClass,
         {}},
        {nullptr, &HsDbDatabase::layerTableId, Hsys::eNullPointer, {}},
    };
    for (const auto& c : cases) {
        HsDbObjectId id;
        EXPECT_EQ(ZyrHdxEquipment::standardRecordId(c.cls, c.table, &db, id), c.expected);
        EXPECT_EQ(id, c.id);
    }
    HsDbObjectPointer<HsDbLayerTableRecord>(db.currentLayerId(), HsDb::kForWrite)->setName(L"Zero");
    HsDbObjectId id;
    EXPECT_EQ(ZyrHdxEquipment::standardRecordId(HsDbLayerTableRecord::desc(),
                                                &HsDbDatabase::layerTableId, &db, id),
              Hsys::eNameNotFound);
}

} // namespace
