// The public/implementation pair on the record bases: the nest of version words in the stream,
// hostile streams, copies, audits, summaries and reported parameter changes.
#include "tests/platform/base/obj/ZyrSampleObjects.h"

#include "platform/base/obj/ZyrClassIdManager.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <cstring>
#include <memory>

namespace {

constexpr unsigned short kSampleRecordNumber = 7001;

// Little-endian bytes as the binary filer lays them out, noting where each version word stands.
class Stream {
public:
    Stream& u16(std::uint16_t value) { return put(&value, sizeof value); }
    Stream& u32(std::uint32_t value) { return put(&value, sizeof value); }
    Stream& real(double value) { return put(&value, sizeof value); }
    Stream& id(std::uint64_t handle) { return put(&handle, sizeof handle); }
    Stream& text(const std::wstring& value) {
        u32(static_cast<std::uint32_t>(value.size()));
        for (const wchar_t c : value)
            u32(static_cast<std::uint32_t>(c));
        return *this;
    }
    // A level's version word; versions 20 to 29 carry the bool that readers drop.
    Stream& version(std::int16_t value) {
        versions.push_back(bytes.size());
        put(&value, sizeof value);
        if (value >= 20 && value <= 29)
            bytes.push_back(1);
        return *this;
    }

    std::vector<std::uint8_t> bytes;
    std::vector<std::size_t> versions;

private:
    Stream& put(const void* value, std::size_t size) {
        const auto* first = static_cast<const std::uint8_t*>(value);
        bytes.insert(bytes.end(), first, first + size);
        return *this;
    }
};

// The stream of a record named "Hall", 2.5 wide, without style or owner, every level at version.
Stream hallStream(std::int16_t version) {
    Stream stream;
    stream.id(0).version(version);                   // HsDbObject's owner, ZyrDbObject
    stream.u16(1).u16(kSampleRecordNumber);          // the implementation object's class, by number
    stream.version(version);                         // ZyrImpObj
    stream.version(version).text(L"Hall").text(L""); // ZyrImpDictRecord
    stream.version(version).real(2.5).id(0);         // ZyrImpSampleRecord
    stream.version(version);                         // ZyrDbDictRecord
    stream.version(version);                         // ZyrDbSampleRecord
    return stream;
}

class ZyrDbObjectPair : public ::testing::Test {
protected:
    static void SetUpTestSuite() {
        ZyrClassIdManager::append(ZyrImpSampleRecord::desc(), kSampleRecordNumber);
    }
    static void TearDownTestSuite() { ZyrClassIdManager::remove(ZyrImpSampleRecord::desc()); }

    // A record that a read must either fill whole or leave as it is.
    static std::unique_ptr<ZyrDbSampleRecord> oldRecord() {
        auto record = std::make_unique<ZyrDbSampleRecord>();
        EXPECT_EQ(record->setName(L"Old"), Hsys::eSuccess);
        EXPECT_EQ(record->sampleImp()->setWidth(9.0), Hsys::eSuccess);
        return record;
    }

    // Ids are read as ids of the filer's database.
    Hsys::ErrorStatus read(ZyrDbSampleRecord& record, std::vector<std::uint8_t> bytes,
                           std::size_t* position = nullptr) {
        HsDbBdfFiler filer(std::move(bytes), &filerDatabase);
        const Hsys::ErrorStatus status = record.bdfIn(&filer);
        if (position != nullptr)
            *position = filer.position();
        return status;
    }

    HsDbDatabase filerDatabase{HsDb::kEmptyDatabase};
};

TEST_F(ZyrDbObjectPair, filesEveryLevelsVersionWordAfterItsBasesFields) {
    ZyrDbSampleRecord record;
    ASSERT_EQ(record.setName(L"Hall"), Hsys::eSuccess);
    ASSERT_EQ(record.sampleImp()->setWidth(2.5), Hsys::eSuccess);
    HsDbBdfFiler filer;
    ASSERT_EQ(record.bdfOut(&filer), Hsys::eSuccess);
    EXPECT_EQ(filer.bytes(), hallStream(80).bytes);
}

TEST_F(ZyrDbObjectPair, readsItsOwnStreamBackWithANewImplementationObject) {
    auto record = oldRecord();
    const ZyrImpObj* before = record->imp();
    ASSERT_EQ(read(*record, hallStream(80).bytes), Hsys::eSuccess);
    ZyrRmCString name;
    ASSERT_EQ(record->getName(name), Hsys::eSuccess);
    EXPECT_EQ(name, L"Hall");
    EXPECT_EQ(record->sampleImp()->width(), 2.5);
    EXPECT_NE(record->imp(), before);
    EXPECT_EQ(record->imp()->dbParent(), record.get());
    EXPECT_EQ(record->filedVersion(), 80);
    EXPECT_EQ(record->imp()->filedVersion(), 80);
}

TEST_F(ZyrDbObjectPair, everyTruncationFailsAndAPartialImplementationIsNeverTaken) {
    const Stream full = hallStream(80);
    // The implementation object ends before the last two version words.
    const std::size_t impEnd = full.versions[full.versions.size() - 2];
    for (std::size_t length = 0; length < full.bytes.size(); ++length) {
        auto record = oldRecord();
        EXPECT_EQ(read(*record, {full.bytes.begin(), full.bytes.begin() + long(length)}),
                  Hsys::eFilerError)
            << "length " << length;
        if (length < impEnd) {
            EXPECT_EQ(record->sampleImp()->width(), 9.0) << "length " << length;
            EXPECT_EQ(record->sampleImp()->name(), L"Old") << "length " << length;
        }
    }
}

TEST_F(ZyrDbObjectPair, aLaterVersionAtAnyLevelStopsTheReadAtThatWord) {
    const Stream full = hallStream(80);
    const std::size_t impEnd = full.versions[full.versions.size() - 2];
    for (const std::size_t at : full.versions) {
        std::vector<std::uint8_t> bytes = full.bytes;
        bytes[at] = 81;
        auto record = oldRecord();
        std::size_t position = 0;
        EXPECT_EQ(read(*record, bytes, &position), Hsys::eNewerVersion) << "word at " << at;
        EXPECT_EQ(position, at + 2) << "nothing is read after the word at " << at;
        if (at < impEnd) {
            EXPECT_EQ(record->sampleImp()->width(), 9.0) << "word at " << at;
        }
    }
}

TEST_F(ZyrDbObjectPair, versionsTwentyToTwentyNineDropABoolAtEveryLevel) {
    const struct {
        std::int16_t version;
        Hsys::ErrorStatus status;
    } cases[] = {{19, Hsys::eSuccess}, {20, Hsys::eSuccess},     {25, Hsys::eSuccess},
                 {29, Hsys::eSuccess}, {30, Hsys::eSuccess},     {80, Hsys::eSuccess},
                 {-1, Hsys::eSuccess}, {81, Hsys::eNewerVersion}};
    for (const auto& c : cases) {
        auto record = oldRecord();
        HsDbBdfFiler filer(hallStream(c.version).bytes, &filerDatabase);
        EXPECT_EQ(record->bdfIn(&filer), c.status) << "version " << c.version;
        if (c.status != Hsys::eSuccess)
            continue;
        EXPECT_EQ(filer.remaining(), 0u) << "version " << c.version;
        EXPECT_EQ(record->sampleImp()->width(), 2.5) << "version " << c.version;
        EXPECT_EQ(record->imp()->filedVersion(), c.version);
    }
}

TEST_F(ZyrDbObjectPair, copyIsDeepAndRefusesOtherClasses) {
    ZyrDbSampleRecord source;
    ASSERT_EQ(source.setName(L"Hall"), Hsys::eSuccess);
    ASSERT_EQ(source.setDescription(L"ground floor"), Hsys::eSuccess);
    ASSERT_EQ(source.sampleImp()->setWidth(4.0), Hsys::eSuccess);
    ZyrDbSampleRecord copy;
    ASSERT_EQ(copy.copyFrom(&source), Hsys::eSuccess);
    ASSERT_EQ(source.sampleImp()->setWidth(5.0), Hsys::eSuccess);
    EXPECT_EQ(copy.sampleImp()->width(), 4.0);
    EXPECT_EQ(copy.sampleImp()->description(), L"ground floor");
    EXPECT_EQ(copy.imp()->dbParent(), &copy);

    std::unique_ptr<HsRxObject> clone(source.clone());
    ZyrDbSampleRecord* cloned = ZyrDbSampleRecord::cast(clone.get());
    ASSERT_NE(cloned, nullptr);
    EXPECT_EQ(cloned->sampleImp()->width(), 5.0);
    EXPECT_EQ(cloned->sampleImp()->name(), L"Hall");

    ZyrDbSampleShape shape;
    EXPECT_EQ(copy.copyFrom(&shape), Hsys::eBadArgument);
    EXPECT_EQ(copy.copyFrom(nullptr), Hsys::eNullPointer);
    EXPECT_EQ(copy.sampleImp()->copyFrom(shape.imp()), Hsys::eBadArgument);
    EXPECT_EQ(copy.sampleImp()->width(), 4.0);
}

TEST_F(ZyrDbObjectPair, aRecordWithoutItsOwnImplementationCopiesAClone) {
    ZyrDbSampleRecord source;
    ASSERT_EQ(source.sampleImp()->setWidth(3.0), Hsys::eSuccess);
    ZyrDbDictRecord plain;
    ASSERT_EQ(plain.copyFrom(&source), Hsys::eSuccess);
    ASSERT_NE(ZyrImpSampleRecord::cast(plain.imp()), nullptr);
    EXPECT_EQ(ZyrImpSampleRecord::cast(plain.imp())->width(), 3.0);
    EXPECT_EQ(plain.imp()->dbParent(), &plain);
    ZyrDbDictRecord empty(false);
    ASSERT_EQ(plain.copyFrom(&empty), Hsys::eSuccess);
    EXPECT_EQ(plain.imp(), nullptr);
    ZyrRmCString name;
    EXPECT_EQ(plain.getName(name), Hsys::eNullPointer);
}

TEST_F(ZyrDbObjectPair, summaryShowsTheClassRowsAfterTheBasesNone) {
    ZyrDbSampleRecord record;
    ASSERT_EQ(record.setName(L"Hall"), Hsys::eSuccess);
    ASSERT_EQ(record.sampleImp()->setWidth(7.0), Hsys::eSuccess);
    ZyrDesc desc;
    record.imp()->summaryInfo(&desc);
    EXPECT_EQ(desc.lines(), (std::vector<ZyrRmCString>{L"Name: Hall", L"Width: 7"}));
    ZyrDesc baseOnly;
    ZyrImpDictRecord().summaryInfo(&baseOnly);
    EXPECT_TRUE(baseOnly.rows().empty());
}

class ZyrDbObjectInDatabase : public ZyrDbObjectPair {
protected:
    HsDbObjectId add(HsDbObject* object) {
        HsDbObjectId id;
        EXPECT_EQ(database.addHsDbObject(id, object), Hsys::eSuccess);
        object->close();
        return id;
    }

    HsDbDatabase database;
};

TEST_F(ZyrDbObjectInDatabase, changesNeedTheRecordOpenForWrite) {
    const HsDbObjectId id = add(new ZyrDbSampleRecord);
    HsDbObjectPointer<ZyrDbSampleRecord> record(id, HsDb::kForRead);
    ASSERT_TRUE(record);
    EXPECT_THROW(record->sampleImp()->setWidth(3.0), HsAssertionViolation);
    EXPECT_THROW(record->setName(L"Hall"), HsAssertionViolation);
    EXPECT_THROW(record->setImp(nullptr), HsAssertionViolation);
    EXPECT_EQ(record->sampleImp()->setWidth(1.0), Hsys::eSuccess) << "unchanged: no write asked";
    ASSERT_EQ(record->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(record->sampleImp()->setWidth(3.0), Hsys::eSuccess);
    EXPECT_TRUE(record->isModified());
}

TEST_F(ZyrDbObjectInDatabase, aChangeIsNotedOnThePublicObject) {
    HsDbObjectPointer<ZyrDbSampleRecord> record(add(new ZyrDbSampleRecord), HsDb::kForWrite);
    ASSERT_EQ(record->sampleImp()->setWidth(3.0), Hsys::eSuccess);
    ASSERT_EQ(record->parameterChanges().size(), 1u);
    const ZyrParamInfo& noted = record->parameterChanges()[0];
    EXPECT_EQ(noted.paramId(), ZyrImpSampleRecord::kWidthParameter);
    EXPECT_EQ(noted.paramClass(), ZyrImpSampleRecord::desc());
    EXPECT_EQ(noted.flags(), ZyrParamChangeFlag::kAll);
    EXPECT_EQ(noted.object(), nullptr) << "notes keep no pointers";
    record->clearParameterChanges();
    EXPECT_TRUE(record->parameterChanges().empty());
}

TEST_F(ZyrDbObjectInDatabase, auditCountsABadStyleAndClearsItWhenItMayFix) {
    const HsDbObjectId style = add(new ZyrDbSampleRecord);
    const HsDbObjectId id = add(new ZyrDbSampleRecord);
    {
        HsDbObjectPointer<ZyrDbSampleRecord> record(id, HsDb::kForWrite);
        ASSERT_EQ(record->sampleImp()->setStyleId(style), Hsys::eSuccess);
        HsDbObjectPointer<ZyrDbSampleRecord> styleRecord(style, HsDb::kForWrite);
        ASSERT_EQ(styleRecord->erase(), Hsys::eSuccess);
    }
    HsDbAuditInfo check(false);
    ASSERT_EQ(database.audit(&check), Hsys::eSuccess);
    EXPECT_EQ(check.numErrors(), 1);
    EXPECT_EQ(check.numFixes(), 0);
    ASSERT_EQ(check.lines().size(), 1u);
    EXPECT_NE(check.lines()[0].find(L"is erased"), std::wstring::npos) << check.lines()[0];

    HsDbAuditInfo fix(true);
    ASSERT_EQ(database.audit(&fix), Hsys::eSuccess);
    EXPECT_EQ(fix.numErrors(), 1);
    EXPECT_EQ(fix.numFixes(), 1);
    HsDbAuditInfo again(false);
    ASSERT_EQ(database.audit(&again), Hsys::eSuccess);
    EXPECT_EQ(again.numErrors(), 0);
}

TEST_F(ZyrDbObjectInDatabase, anAbortedTransactionPutsTheImplementationBack) {
    const HsDbObjectId id = add(new ZyrDbSampleRecord);
    HsDbTransactionManager* transactions = database.transactionManager();
    transactions->startTransaction();
    HsDbObject* opened = nullptr;
    ASSERT_EQ(transactions->getObject(opened, id, HsDb::kForWrite), Hsys::eSuccess);
    auto* record = ZyrDbSampleRecord::cast(opened);
    ASSERT_EQ(record->setName(L"Renamed"), Hsys::eSuccess);
    ASSERT_EQ(record->sampleImp()->setWidth(6.0), Hsys::eSuccess);
    ASSERT_EQ(transactions->abortTransaction(), Hsys::eSuccess);
    HsDbObjectPointer<ZyrDbSampleRecord> restored(id, HsDb::kForRead);
    EXPECT_EQ(restored->sampleImp()->width(), 1.0);
    EXPECT_EQ(restored->sampleImp()->name(), L"");
    EXPECT_EQ(restored->imp()->dbParent(), restored.object());
}

} // namespace
