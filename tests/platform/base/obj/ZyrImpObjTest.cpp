// Implementation objects: parents through nesting, reported parameter changes travelling up to
// the public object, reference checks, database defaults, and the owning array.
#include "tests/platform/base/obj/ZyrSampleObjects.h"

#include "platform/base/obj/ZyrEnhancedReferenceAuditInfo.h"
#include "platform/base/obj/ZyrImpArray.h"
#include "platform/base/obj/ZyrParamContainer.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

namespace {

// Restates a change anywhere below it as a change of its own parameter 0, the way a record
// reports a change deep in its tree; logs how a new object is made ready.
class ZyrImpSampleHolder : public ZyrImpObj {
    HSRX_DECLARE_MEMBERS(ZyrImpSampleHolder)

public:
    ZyrImpSampleHolder() { children.setParent(this); }

    Hsys::ErrorStatus parameterChanged(ZyrParamContainer& container) override {
        const ZyrParamInfo* last = container.last();
        if (last != nullptr && last->paramClass() != ZyrImpSampleHolder::desc())
            container.add(new ZyrParamInfo(0, ZyrImpSampleHolder::desc(), this));
        return Hsys::eSuccess;
    }
    Hsys::ErrorStatus setToStandard(HsDbDatabase*) override {
        calls += "standard ";
        return Hsys::eSuccess;
    }
    Hsys::ErrorStatus subSetDatabaseDefaults(HsDbDatabase*) override {
        calls += "defaults ";
        return Hsys::eSuccess;
    }

    ZyrImpArray children;
    std::string calls;
};

HSRX_DEFINE_MEMBERS(ZyrImpSampleHolder, ZyrImpObj, 0, hsrxInstantiateClass<ZyrImpSampleHolder>)

TEST(ZyrImpObj, dbParentIsThePublicObjectAtTheTopOfTheNestAndCyclesAreRefused) {
    ZyrDbObject owner(false);
    auto* holder = new ZyrImpSampleHolder;
    owner.setImp(holder);
    auto* leaf = new ZyrImpDictRecord;
    ASSERT_EQ(holder->children.append(leaf), Hsys::eSuccess);
    EXPECT_EQ(leaf->dbParent(), &owner);
    EXPECT_EQ(ZyrImpDictRecord().dbParent(), nullptr);
    EXPECT_EQ(leaf->database(), nullptr) << "the owner is in no database";
    EXPECT_THROW(holder->setParent(static_cast<ZyrImpObj*>(leaf)), HsAssertionViolation);
    EXPECT_THROW(holder->setParent(static_cast<ZyrImpObj*>(holder)), HsAssertionViolation);
    EXPECT_EQ(holder->dbParent(), &owner) << "a refused parent changes nothing";

    EXPECT_EQ(holder->initializeStandardsAndDefaults(nullptr), Hsys::eSuccess);
    EXPECT_EQ(holder->calls, "standard defaults ");
    EXPECT_EQ(ZyrDbObject(false).initializeStandardsAndDefaults(nullptr), Hsys::eNullPointer);
}

TEST(ZyrImpObj, aChangeTravelsUpAndIsNotedOnceInTheRecordsTerms) {
    HsDbDatabase database;
    auto* owner = new ZyrDbObject(false);
    auto* holder = new ZyrImpSampleHolder;
    owner->setImp(holder);
    auto* leaf = new ZyrImpSampleRecord;
    ASSERT_EQ(holder->children.append(leaf), Hsys::eSuccess);
    HsDbObjectId id;
    ASSERT_EQ(database.addHsDbObject(id, owner), Hsys::eSuccess);

    ASSERT_EQ(leaf->setWidth(3.0), Hsys::eSuccess);
    const std::vector<ZyrParamInfo>& notes = owner->parameterChanges();
    ASSERT_EQ(notes.size(), 2u);
    EXPECT_EQ(notes[0].paramClass(), ZyrImpSampleRecord::desc());
    EXPECT_EQ(notes[0].paramId(), ZyrImpSampleRecord::kWidthParameter);
    EXPECT_EQ(notes[1].paramClass(), ZyrImpSampleHolder::desc());
    EXPECT_EQ(notes[1].paramId(), 0);
    owner->clearParameterChanges();
    holder->recordParameterChanged(5, ZyrImpSampleHolder::desc(), ZyrParamChangeFlag::kDisplay,
                                   nullptr);
    ASSERT_EQ(owner->parameterChanges().size(), 1u) << "the holder's own change is not restated";
    EXPECT_EQ(owner->parameterChanges()[0].flags(), ZyrParamChangeFlag::kDisplay);
    owner->close();
}

TEST(ZyrImpObj, referencesThatHaveNoObjectOrAnErasedOneAreCountedAndExplained) {
    HsDbDatabase database;
    HsDbObjectId erased;
    auto* record = new ZyrDbSampleRecord;
    ASSERT_EQ(database.addHsDbObject(erased, record), Hsys::eSuccess);
    ASSERT_EQ(record->erase(), Hsys::eSuccess);
    record->close();
    HsDbObjectId missing;
    ASSERT_EQ(database.getHsDbObjectId(missing, true, 999), Hsys::eSuccess);

    ZyrSampleOverride override;
    for (const HsDbObjectId& id : {erased, missing, database.modelSpaceId()})
        override.add(id);
    int bad = 0;
    EXPECT_EQ(override.verifyReferences(bad, true), Hsys::eSuccess);
    EXPECT_EQ(bad, 2);
    EXPECT_EQ(override.records().size(), 3u) << "this level cannot repair";
    ZyrEnhancedReferenceAuditInfo info;
    ASSERT_EQ(override.verifyReferences(info), Hsys::eSuccess);
    ASSERT_EQ(info.badReferences().size(), 2u);
    EXPECT_EQ(info.badReferences()[0].id, erased);
    EXPECT_EQ(info.badReferences()[0].message.str(), L"ZyrSampleOverride refers to " +
                                                         std::to_wstring(erased.handle()) +
                                                         L", which is erased");
    EXPECT_EQ(info.badReferences()[1].message.str(),
              L"ZyrSampleOverride refers to 999, which has no object");
}

// ---- the owning array ----

class ZyrImpArrayOf : public ::testing::Test {
protected:
    static ZyrImpDictRecord* named(const wchar_t* name) {
        auto* record = new ZyrImpDictRecord;
        EXPECT_EQ(record->setName(name), Hsys::eSuccess);
        return record;
    }
    // An array of a record named name, a profile and a record named "second".
    static void fill(ZyrImpArray& array, const wchar_t* name) {
        EXPECT_EQ(array.append(named(name)), Hsys::eSuccess);
        EXPECT_EQ(array.append(new ZyrGeProfile), Hsys::eSuccess);
        EXPECT_EQ(array.append(named(L"second")), Hsys::eSuccess);
    }

    static std::vector<std::wstring> describe(const ZyrImpArray& array) {
        std::vector<std::wstring> entries;
        for (int i = 0; i < array.length(); ++i) {
            const ZyrImpDictRecord* record = ZyrImpDictRecord::cast(array.at(i));
            entries.push_back(record != nullptr ? record->name().str()
                                                : array.at(i)->isA()->name());
        }
        return entries;
    }

    HsDbDatabase filerDatabase{HsDb::kEmptyDatabase};
};

TEST_F(ZyrImpArrayOf, insertsOwnsAndHandsBackEntries) {
    ZyrImpArray array;
    fill(array, L"first");
    auto* front = new ZyrImpDictRecord;
    EXPECT_EQ(array.insertAt(0, front), Hsys::eSuccess);
    EXPECT_EQ(array.insertAt(0, front), Hsys::eAlreadyPresent);
    ZyrImpDictRecord refused;
    EXPECT_EQ(array.insertAt(6, &refused), Hsys::eInvalidIndex) << "the caller keeps it";
    EXPECT_EQ(refused.impParent(), nullptr);
    EXPECT_EQ(array.insertAt(0, nullptr), Hsys::eNullPointer);
    EXPECT_EQ(front->impParent(), &array);
    EXPECT_EQ(describe(array),
              (std::vector<std::wstring>{L"", L"first", L"ZyrGeProfile", L"second"}));

    std::unique_ptr<ZyrImpObj> taken(array.removeAt(1));
    ASSERT_NE(taken, nullptr);
    EXPECT_EQ(taken->impParent(), nullptr);
    EXPECT_EQ(array.removeAt(3), nullptr);
    EXPECT_EQ(array.deleteAt(-1), Hsys::eInvalidIndex);
    EXPECT_EQ(array.deleteAt(0), Hsys::eSuccess);
    EXPECT_EQ(describe(array), (std::vector<std::wstring>{L"ZyrGeProfile", L"second"}));
}

TEST_F(ZyrImpArrayOf, binaryStreamsRoundTripAndHostileOnesLeaveTheArrayAsItWas) {
    ZyrImpArray source;
    fill(source, L"first");
    HsDbBdfFiler writer;
    ASSERT_EQ(source.bdfOutFields(&writer), Hsys::eSuccess);
    const std::vector<std::uint8_t>& bytes = writer.bytes();
    ZyrImpArray copy;
    HsDbBdfFiler reader(bytes, &filerDatabase);
    ASSERT_EQ(copy.bdfInFields(&reader), Hsys::eSuccess);
    EXPECT_EQ(describe(copy), describe(source));
    EXPECT_EQ(copy.at(2)->impParent(), &copy);

    std::vector<std::vector<std::uint8_t>> streams;
    for (std::size_t length = 0; length < bytes.size(); ++length)
        streams.emplace_back(bytes.begin(), bytes.begin() + long(length));
    // Two version words, then a count far beyond the bytes; then a null entry.
    streams.push_back({80, 0, 80, 0, 0xff, 0xff, 0xff, 0x0f, 0, 0});
    streams.push_back({80, 0, 80, 0, 1, 0, 0, 0, 0, 0});
    for (const std::vector<std::uint8_t>& stream : streams) {
        ZyrImpArray array;
        fill(array, L"kept");
        HsDbBdfFiler hostile(stream, &filerDatabase);
        EXPECT_EQ(array.bdfInFields(&hostile), Hsys::eFilerError) << "length " << stream.size();
        EXPECT_EQ(describe(array), (std::vector<std::wstring>{L"kept", L"ZyrGeProfile", L"second"}))
            << "length " << stream.size();
    }
    // A count the bytes cannot hold is refused before any entry is reserved or read.
    HsDbBdfFiler beyond(streams[bytes.size()], &filerDatabase);
    ZyrImpArray array;
    EXPECT_EQ(array.bdfInFields(&beyond), Hsys::eFilerError);
    EXPECT_EQ(beyond.position(), 8u);
}

TEST_F(ZyrImpArrayOf, textStreamsRoundTripAndThoseOfAnotherArrayOrAnUnknownClassAreRefused) {
    ZyrImpArray source;
    source.setTdfControlString(L"ONE");
    fill(source, L"first");
    HsDbTdfFiler writer(HsDb::kCopyFiler, true);
    ASSERT_EQ(source.tdfOutFields(&writer), Hsys::eSuccess);
    ZyrImpArray copy;
    copy.setTdfControlString(L"ONE");
    HsDbTdfFiler reader(writer.items(), HsDb::kCopyFiler, true);
    ASSERT_EQ(copy.tdfInFields(&reader), Hsys::eSuccess);
    EXPECT_EQ(copy.length(), 3);
    EXPECT_NE(ZyrGeProfile::cast(copy.at(1)), nullptr);

    // Each case replaces one item of the written stream: control string, count, first class.
    const struct {
        const char* name;
        std::size_t at;
        HsDbTdfItem item;
    } cases[] = {
        {"another control string", 0, {ZyrImpArray::kControlGroupCode, L"TWO"}},
        {"a count beyond the items", 1, {ZyrImpArray::kCountGroupCode, std::int32_t{40}}},
        {"an unknown class", 2, {ZyrImpArray::kClassGroupCode, L"NoSuchClass"}},
        {"a class name that is a number", 2, {ZyrImpArray::kClassGroupCode, std::int32_t{1}}},
    };
    for (const auto& c : cases) {
        std::vector<HsDbTdfItem> items = writer.items();
        items[c.at] = c.item;
        ZyrImpArray array;
        array.setTdfControlString(L"ONE");
        fill(array, L"kept");
        HsDbTdfFiler hostile(items, HsDb::kCopyFiler, true);
        EXPECT_EQ(array.tdfInFields(&hostile), Hsys::eBadTdfSequence) << c.name;
        EXPECT_FALSE(hostile.errorMessage().empty()) << c.name;
        EXPECT_EQ(describe(array)[0], L"kept") << c.name;
    }
}

TEST_F(ZyrImpArrayOf, copyIsDeepAndOperationsReachEveryEntry) {
    ZyrImpArray source;
    fill(source, L"first");
    ZyrImpArray copy;
    ASSERT_EQ(copy.copyFrom(&source), Hsys::eSuccess);
    EXPECT_EQ(describe(copy), describe(source));
    EXPECT_NE(copy.at(0), source.at(0));
    EXPECT_EQ(copy.at(0)->impParent(), &copy);
    EXPECT_EQ(copy.copyFrom(&copy), Hsys::eSuccess);
    EXPECT_EQ(copy.copyFrom(std::make_unique<ZyrImpDictRecord>().get()), Hsys::eBadArgument);

    HsDbDatabase database;
    ZyrImpArray holders;
    auto* override = new ZyrSampleOverride;
    override->add(database.modelSpaceId());
    override->add(database.layerTableId());
    ASSERT_EQ(holders.append(new ZyrImpSampleHolder), Hsys::eSuccess);
    ASSERT_EQ(holders.append(override), Hsys::eSuccess);
    ZyrObjReferenceMap map;
    EXPECT_EQ(holders.getReferencedObjects(map), Hsys::eSuccess);
    EXPECT_EQ(map.count(), 2);
    EXPECT_EQ(holders.setToStandard(&database), Hsys::eSuccess);
    EXPECT_EQ(ZyrImpSampleHolder::cast(holders.at(0))->calls, "standard ");
    HsDbAuditInfo info;
    EXPECT_EQ(holders.audit(&info), Hsys::eAuditNoParent) << "the first status that is not 0";
}

} // namespace
