// Dictionaries of records: creation on request only, the one standard record, unique names,
// renames that keep ids, foreign entries, clones across drawings and the names in use.
#include "platform/base/dict/ZyrDict.h"
#include "platform/base/app/ZyrAppHdx.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "tests/platform/base/dict/ZyrDictTestRecords.h"

#include <gtest/gtest.h>

#include <string>

namespace {

class ZyrDictTest : public testing::Test {
protected:
    int namedEntries() {
        HsDbObjectPointer<HsDbDictionary> named(db.namedObjectsDictionaryId(), HsDb::kForRead);
        return named->numEntries();
    }

    HsDbDatabase db;
    ZyrTestStyleDict styles{&db};
};

TEST_F(ZyrDictTest, readersCreateNothingAndEachFlagCreatesItsPart) {
    const int before = namedEntries();
    HsDbObjectId id;
    EXPECT_FALSE(styles.isValid(false, false));
    EXPECT_FALSE(styles.isValid(false, true));
    EXPECT_EQ(styles.getAt(L"Standard", id), Hsys::eInvalidDictionary);
    EXPECT_TRUE(styles.standardRecord().isNull());
    EXPECT_EQ(namedEntries(), before);
    EXPECT_FALSE(ZyrDict(L"ZYR_TEST_ENTITIES", ZyrTestStyledEntity::desc(), nullptr, false, &db)
                     .isValid(true, true));
    EXPECT_FALSE(ZyrTestStyleDict(nullptr).isValid(true, true));
    EXPECT_EQ(namedEntries(), before);

    EXPECT_TRUE(styles.isValid(true, false));
    EXPECT_TRUE(styles.hsdbDictionaryExists());
    EXPECT_TRUE(styles.standardRecord().isNull());
    EXPECT_TRUE(styles.isValid(false, true));
    EXPECT_EQ(storedName(styles.standardRecord()), L"Standard");
}

TEST_F(ZyrDictTest, standardRecordAppearsOnceAndIsRemadeOnlyWhenGone) {
    ASSERT_TRUE(styles.isValid(true, true));
    const HsDbObjectId standard = styles.standardRecord();
    EXPECT_TRUE(ZyrTestStyleDict(&db).isValid(true, true));
    EXPECT_EQ(styles.ensureStandardEntries(), Hsys::eSuccess);
    ZyrStrObjIdList records;
    ASSERT_EQ(styles.getRecordList(records), Hsys::eSuccess);
    ZyrStrObjIdList expected;
    expected.add(L"Standard", standard);
    EXPECT_EQ(records, expected);
    EXPECT_EQ(records.find(L"STANDARD"), 0);

    HsDbObjectPointer<ZyrDbDictRecord>(standard, HsDb::kForWrite)->erase();
    EXPECT_TRUE(styles.standardRecord().isNull());
    EXPECT_TRUE(styles.isValid(false, true));
    EXPECT_NE(styles.standardRecord(), standard);
    ZyrTestStyleDict withoutStandard(&db, false);
    EXPECT_EQ(withoutStandard.ensureStandardEntries(), Hsys::eSuccess);
    EXPECT_TRUE(withoutStandard.standardRecord().isNull());
}

TEST_F(ZyrDictTest, addNewRecordRefusesAndLeavesTheRecordAsItWas) {
    ASSERT_TRUE(styles.isValid(true, true));
    const std::wstring longest(ZyrDict::kMaxNameLength, L'n');
    const std::wstring tooLong(ZyrDict::kMaxNameLength + 1, L'n');
    const std::pair<const wchar_t*, Hsys::ErrorStatus> names[] = {
        {nullptr, Hsys::eNullPointer},           {L"", Hsys::eBadArgument},
        {tooLong.c_str(), Hsys::eStringTooLong}, {L"STANDARD", Hsys::eDuplicateName},
        {longest.c_str(), Hsys::eSuccess},
    };
    for (const auto& [name, expected] : names) {
        HsDbObjectPointer<ZyrDbDictRecord> record(styles.newEntry());
        record->setName(L"kept");
        EXPECT_EQ(styles.addNewRecord(name, record.object()), expected);
        ZyrRmCString now;
        record->getName(now);
        EXPECT_EQ(now, expected == Hsys::eSuccess ? ZyrRmCString(name) : ZyrRmCString(L"kept"));
    }
    ZyrTestLabel label;
    EXPECT_EQ(styles.addNewRecord(L"Label", &label), Hsys::eWrongClass);
    HsDbObjectPointer<ZyrDbDictRecord> inDatabase(styles.standardRecord(), HsDb::kForWrite);
    EXPECT_EQ(styles.addNewRecord(L"Again", inDatabase.object()), Hsys::eAlreadyPresent);
    HsDbDatabase other;
    ZyrTestStyle unplaced;
    EXPECT_EQ(ZyrTestStyleDict(&other).addNewRecord(L"Office", &unplaced),
              Hsys::eInvalidDictionary);
}

TEST_F(ZyrDictTest, renamedRecordKeepsItsIdAndBothNamesFollow) {
    ASSERT_TRUE(styles.isValid(true, true));
    const HsDbObjectId office = styles.add(L"Office");
    styles.add(L"Hall");
    const struct {
        const wchar_t* from;
        const wchar_t* to;
        Hsys::ErrorStatus expected;
        const wchar_t* nameAfter;
    } steps[] = {
        {L"Office", L"Meeting", Hsys::eSuccess, L"Meeting"},
        {L"meeting", L"MEETING", Hsys::eSuccess, L"MEETING"}, // a change of case alone is taken
        {L"MEETING", L"hall", Hsys::eDuplicateName, L"MEETING"},
        {L"MEETING", L"", Hsys::eBadArgument, L"MEETING"},
        {L"Office", L"Lobby", Hsys::eNameNotFound, L"MEETING"},
        {L"Standard", L"Default", Hsys::eDoesNotApply, L"MEETING"},
    };
    for (const auto& step : steps) {
        EXPECT_EQ(styles.renameRecord(step.from, step.to), step.expected) << step.to;
        HsDbObjectId id;
        EXPECT_EQ(styles.getAt(step.nameAfter, id), Hsys::eSuccess);
        EXPECT_EQ(id, office);
        EXPECT_EQ(storedName(office), step.nameAfter);
    }
    HsDbObjectId id = office;
    EXPECT_EQ(styles.getAt(L"Office", id), Hsys::eNameNotFound);
    EXPECT_TRUE(id.isNull()) << "a failed lookup must not leave the last id behind";

    HsDbObjectPointer<ZyrDbDictRecord> reader(office, HsDb::kForRead);
    EXPECT_EQ(styles.renameRecord(office, L"Studio"), Hsys::eWasOpenForRead);
    reader.close();
    EXPECT_TRUE(styles.has(L"MEETING"));
    db.transactionManager()->startTransaction();
    ASSERT_EQ(styles.renameRecord(office, L"Studio"), Hsys::eSuccess);
    ASSERT_EQ(db.transactionManager()->abortTransaction(), Hsys::eSuccess);
    EXPECT_TRUE(styles.has(L"MEETING"));
    EXPECT_FALSE(styles.has(L"Studio"));
    EXPECT_EQ(storedName(office), L"MEETING");
}

// Keeps the records that came in from other drawings.
class ImportingDict : public ZyrTestStyleDict {
public:
    using ZyrTestStyleDict::ZyrTestStyleDict;
    Hsys::ErrorStatus postImport(const HsDbObjectId& id) override {
        imported.push_back(id);
        return Hsys::eSuccess;
    }
    std::vector<HsDbObjectId> imported;
};

TEST_F(ZyrDictTest, cloneEntryCopiesUnderANewNameAndTellsOfImports) {
    ASSERT_TRUE(styles.isValid(true, true));
    const HsDbObjectId office = styles.add(L"Office");
    HsDbObjectPointer<ZyrDbDictRecord>(office, HsDb::kForWrite)->setDescription(L"desks");
    HsDbDatabase other;
    ImportingDict here(&db);
    ImportingDict there(&other);
    ASSERT_TRUE(there.isValid(true, false));
    HsDbObjectId copy;
    HsDbObjectId imported;
    ASSERT_EQ(here.cloneEntry(office, L"Office 2", copy), Hsys::eSuccess);
    ASSERT_EQ(there.cloneEntry(office, L"Office", imported), Hsys::eSuccess);
    EXPECT_EQ(there.cloneEntry(db.layerTableId(), L"Layers", copy), Hsys::eWrongClass);
    EXPECT_TRUE(here.imported.empty());
    EXPECT_EQ(there.imported, std::vector<HsDbObjectId>{imported});
    ZyrRmCString description;
    HsDbObjectPointer<ZyrDbDictRecord>(imported, HsDb::kForRead)->getDescription(description);
    EXPECT_EQ(description, L"desks");
    EXPECT_EQ(storedName(copy), L"Office 2");
}

TEST_F(ZyrDictTest, namesInUseFollowTheReferencesOfTheDrawing) {
    ASSERT_TRUE(styles.isValid(true, true));
    const HsDbObjectId office = styles.add(L"Office");
    styles.add(L"Hall");
    ZyrRmCStringArray names{L"given"};
    ASSERT_EQ(styles.getNamesInUse(names), Hsys::eSuccess); // no graph: nothing is shown unused
    EXPECT_EQ(names, (ZyrRmCStringArray{L"given", L"Hall", L"Office", L"Standard"}));

    AFX_EXTENSION_MODULE extension;
    ZyrAppHdx app(L"ZyrDictTest80", &extension, extension, L"ZyrDictTest");
    ASSERT_EQ(ZyrBaseServices::registerService(&app), Hsys::eSuccess);
    const HsDbObjectId user = addStyledEntity(db, office);
    names.clear();
    styles.getNamesInUse(names);
    EXPECT_EQ(names, (ZyrRmCStringArray{L"Office", L"Standard"}));
    HsDbObjectPointer<ZyrTestStyledEntity>(user, HsDb::kForWrite)->erase();
    names.clear();
    styles.getNamesInUse(names);
    EXPECT_EQ(names, ZyrRmCStringArray{L"Standard"});
    ZyrBaseServices::unRegisterService(&app);
}

} // namespace
