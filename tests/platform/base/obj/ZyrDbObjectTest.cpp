// The public/implementation pair on the record bases: the nest of version words in the stream,
// hostile streams, copies, audits, summaries and reported parameter changes.
#include "tests/platform/base/obj/ZyrSampleObjects.h"

#include "platform/base/obj/ZyrClassIdManager.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

constexpr unsigned short kSampleRecordNumber = 7001;

// Little-endian bytes as the binary filer lays them out, noting where each version word stands.
struct Stream {
    template <class T> Stream& put(T value) {
        const auto* first = reinterpret_cast<const std::uint8_t*>(&value);
        bytes.insert(bytes.end(), first, first + sizeof value);
        return *this;
    }
    Stream& text(const std::wstring& value) {
        put(static_cast<std::uint32_t>(value.size()));
        for (const wchar_t c : value)
            put(static_cast<std::uint32_t>(c));
        return *this;
    }
    // A level's version word, with the bool that versions 20 to 29 carry.
    Stream& version(std::int16_t value) {
        versions.push_back(bytes.size());
        put(value);
        if (value >= 20 && value <= 29)
            bytes.push_back(1);
        return *this;
    }

    std::vector<std::uint8_t> bytes;
    std::vector<std::size_t> versions;
};

// The stream of a record named "Hall", 2.5 wide, without style or owner, every level at version.
Stream hallStream(std::int16_t version) {
    Stream stream;
    const std::uint64_t null = 0;
    stream.put(null).version(version);                     // HsDbObject's owner, ZyrDbObject
    stream.put<std::uint16_t>(1).put(kSampleRecordNumber); // the imp's class, by number
    stream.version(version);                               // ZyrImpObj
    stream.version(version).text(L"Hall").text(L"");       // ZyrImpDictRecord
    stream.version(version).put(2.5).put(null);            // ZyrImpSampleRecord
    stream.version(version);                               // ZyrDbDictRecord
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

    // Ids are read as ids of the filer's database; the filer stays for the caller to inspect.
    Hsys::ErrorStatus read(ZyrDbSampleRecord& record, std::vector<std::uint8_t> bytes) {
        filer = std::make_unique<HsDbBdfFiler>(std::move(bytes), &filerDatabase);
        return record.bdfIn(filer.get());
    }

    HsDbDatabase filerDatabase{HsDb::kEmptyDatabase};
    std::unique_ptr<HsDbBdfFiler> filer;
};

// Versions 20 to 29 carry a bool after the word at every level, which readers drop.
TEST_F(ZyrDbObjectPair, filesEveryLevelAfterItsBasesAndReadsEveryVersionBackWhole) {
    ZyrDbSampleRecord hall;
    ASSERT_EQ(hall.setName(L"Hall"), Hsys::eSuccess);
    ASSERT_EQ(hall.sampleImp()->setWidth(2.5), Hsys::eSuccess);
    HsDbBdfFiler writer;
    ASSERT_EQ(hall.bdfOut(&writer), Hsys::eSuccess);
    EXPECT_EQ(writer.bytes(), hallStream(80).bytes);

    for (const std::int16_t version : {80, 19, 20, 25, 29, 30, -1}) {
        auto record = oldRecord();
        const ZyrImpObj* before = record->imp();
        const Stream stream = hallStream(version);
        ASSERT_EQ(read(*record, stream.bytes), Hsys::eSuccess) << version;
        EXPECT_EQ(filer->position(), stream.bytes.size()) << version;
        EXPECT_EQ(record->sampleImp()->name(), L"Hall") << version;
        EXPECT_EQ(record->sampleImp()->width(), 2.5) << version;
        EXPECT_NE(record->imp(), before) << "a read takes a new implementation object";
        EXPECT_EQ(record->imp()->dbParent(), record.get());
        EXPECT_EQ(record->filedVersion(), version);
        EXPECT_EQ(record->imp()->filedVersion(), version);
    }
    ZyrDesc desc; // the bases add no summary rows
    hall.imp()->summaryInfo(&desc);
    EXPECT_EQ(desc.lines(), (std::vector<ZyrRmCString>{L"Name: Hall", L"Width: 2"}));
}

TEST_F(ZyrDbObjectPair, truncatedOrLaterStreamsFailAndAPartialImplementationIsNeverTaken) {
    const Stream full = hallStream(80);
    // The implementation object ends before the last version word.
    const std::size_t impEnd = full.versions.back();
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
    // A later version at any level stops the read at that word.
    for (const std::size_t at : full.versions) {
        std::vector<std::uint8_t> bytes = full.bytes;
        bytes[at] = 81;
        auto record = oldRecord();
        EXPECT_EQ(read(*record, bytes), Hsys::eNewerVersion) << "word at " << at;
        EXPECT_EQ(filer->position(), at + 2) << "nothing is read after the word at " << at;
        EXPECT_EQ(record->sampleImp()->width(), at < impEnd ? 9.0 : 2.5) << "word at " << at;
    }
}

TEST_F(ZyrDbObjectPair, copyIsDeepAndRefusesOtherClasses) {
    ZyrDbSampleRecord source;
    ASSERT_EQ(source.setDescription(L"ground floor"), Hsys::eSuccess);
    ASSERT_EQ(source.sampleImp()->setWidth(4.0), Hsys::eSuccess);
    ZyrDbSampleRecord copy;
    ASSERT_EQ(copy.copyFrom(&source), Hsys::eSuccess);
    ASSERT_EQ(source.sampleImp()->setWidth(5.0), Hsys::eSuccess);
    EXPECT_EQ(copy.sampleImp()->width(), 4.0);
    EXPECT_EQ(copy.sampleImp()->description(), L"ground floor");
    EXPECT_EQ(copy.imp()->dbParent(), &copy);
    std::unique_ptr<HsRxObject> clone(source.clone());
    ASSERT_NE(ZyrDbSampleRecord::cast(clone.get()), nullptr);
    EXPECT_EQ(ZyrDbSampleRecord::cast(clone.get())->sampleImp()->width(), 5.0);

    ZyrDbSampleShape shape;
    EXPECT_EQ(copy.copyFrom(&shape), Hsys::eBadArgument);
    EXPECT_EQ(copy.copyFrom(nullptr), Hsys::eNullPointer);
    EXPECT_EQ(copy.sampleImp()->copyFrom(shape.imp()), Hsys::eBadArgument);
    EXPECT_EQ(copy.sampleImp()->width(), 4.0);

    // A record without an implementation class of its own takes a clone of the source's.
    ZyrDbDictRecord plain;
    ASSERT_EQ(plain.copyFrom(&source), Hsys::eSuccess);
    ASSERT_NE(ZyrImpSampleRecord::cast(plain.imp()), nullptr);
    EXPECT_EQ(ZyrImpSampleRecord::cast(plain.imp())->width(), 5.0);
    EXPECT_EQ(plain.imp()->dbParent(), &plain);
    ASSERT_EQ(plain.copyFrom(std::make_unique<ZyrDbDictRecord>(false).get()), Hsys::eSuccess);
    EXPECT_EQ(plain.imp(), nullptr);
    ZyrRmCString name;
    EXPECT_EQ(plain.getName(name), Hsys::eNullPointer);
}

class ZyrDbObjectInDatabase : public ZyrDbObjectPair {
protected:
    HsDbObjectId add(HsDbObject* object) { return addClosed(database, object); }

    HsDbDatabase database;
};

TEST_F(ZyrDbObjectInDatabase, changesNeedTheRecordOpenForWriteAndAreNotedOnThePublicObject) {
    HsDbObjectPointer<ZyrDbSampleRecord> record(add(new ZyrDbSampleRecord), HsDb::kForRead);
    EXPECT_THROW(record->sampleImp()->setWidth(3.0), HsAssertionViolation);
    EXPECT_THROW(record->setName(L"Hall"), HsAssertionViolation);
    EXPECT_THROW(record->setImp(nullptr), HsAssertionViolation);
    EXPECT_EQ(record->sampleImp()->setWidth(1.0), Hsys::eSuccess) << "unchanged: no write asked";
    ASSERT_EQ(record->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(record->sampleImp()->setWidth(3.0), Hsys::eSuccess);
    EXPECT_TRUE(record->isModified());
    ASSERT_EQ(record->parameterChanges().size(), 1u);
    const ZyrParamInfo& noted = record->parameterChanges()[0];
    EXPECT_EQ(noted.paramId(), ZyrImpSampleRecord::kWidthParameter);
    EXPECT_EQ(noted.paramClass(), ZyrImpSampleRecord::desc());
    EXPECT_EQ(noted.flags(), ZyrParamChangeFlag::kAll);
    EXPECT_EQ(noted.object(), nullptr) << "notes keep no pointers";
}

TEST_F(ZyrDbObjectInDatabase, auditCountsABadStyleAndClearsItWhenItMayFix) {
    const HsDbObjectId style = add(new ZyrDbSampleRecord);
    const HsDbObjectId id = add(new ZyrDbSampleRecord);
    ASSERT_EQ(
        HsDbObjectPointer<ZyrDbSampleRecord>(id, HsDb::kForWrite)->sampleImp()->setStyleId(style),
        Hsys::eSuccess);
    ASSERT_EQ(HsDbObjectPointer<ZyrDbSampleRecord>(style, HsDb::kForWrite)->erase(),
              Hsys::eSuccess);
    for (const bool fix : {false, true}) {
        HsDbAuditInfo info(fix);
        ASSERT_EQ(database.audit(&info), Hsys::eSuccess);
        EXPECT_EQ(info.numErrors(), 1);
        EXPECT_EQ(info.numFixes(), fix ? 1 : 0);
        ASSERT_EQ(info.lines().size(), 1u);
        EXPECT_NE(info.lines()[0].find(L"is erased"), std::wstring::npos) << info.lines()[0];
    }
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
