// Filing helpers: version words with their gates, system strings, and nested implementation
// objects with their class, against hostile streams.
#include "platform/base/obj/ZyrFiling.h"

#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/obj/ZyrClassIdManager.h"
#include "platform/base/obj/ZyrImpDictRecord.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbBdfFiler.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

std::vector<std::uint8_t> le16(std::uint16_t a, std::uint16_t b) {
    return {static_cast<std::uint8_t>(a), static_cast<std::uint8_t>(a >> 8),
            static_cast<std::uint8_t>(b), static_cast<std::uint8_t>(b >> 8)};
}

// The head of a nested object filed by class name.
std::vector<std::uint8_t> byName(const wchar_t* name) {
    HsDbBdfFiler writer;
    writer.writeUInt16(2);
    writer.writeString(name);
    return writer.bytes();
}

TEST(ZyrFiling, versionWordsAreGatedAsEveryLevelReadsThem) {
    const struct {
        std::vector<std::uint8_t> bytes;
        Hsys::ErrorStatus status;
        std::int16_t version;
        std::size_t consumed;
    } cases[] = {
        {{80, 0}, Hsys::eSuccess, 80, 2},
        {{81, 0, 1}, Hsys::eNewerVersion, 81, 2},
        {{0xff, 0x7f}, Hsys::eNewerVersion, 0x7fff, 2},
        {{0xff, 0xff}, Hsys::eSuccess, -1, 2},
        {{19, 0, 1}, Hsys::eSuccess, 19, 2},
        {{20, 0, 1}, Hsys::eSuccess, 20, 3},
        {{29, 0, 0}, Hsys::eSuccess, 29, 3},
        {{30, 0, 1}, Hsys::eSuccess, 30, 2},
        {{25, 0}, Hsys::eFilerError, 25, 2},
        {{25, 0, 2}, Hsys::eFilerError, 25, 2},
        {{80}, Hsys::eFilerError, 7, 0},
    };
    for (const auto& c : cases) {
        HsDbBdfFiler filer(c.bytes, nullptr);
        std::int16_t version = 7;
        EXPECT_EQ(Zyr::bdfReadVersion(&filer, version), c.status) << c.version;
        EXPECT_EQ(version, c.version);
        EXPECT_EQ(filer.position(), c.consumed) << c.version;
    }
    HsDbBdfFiler writer;
    ASSERT_EQ(Zyr::bdfWriteVersion(&writer), Hsys::eSuccess);
    EXPECT_EQ(writer.bytes(), (std::vector<std::uint8_t>{80, 0}));
}

TEST(ZyrFiling, systemStringsRoundTripAndAShortOneLeavesTheTextAlone) {
    HsDbBdfFiler writer;
    ASSERT_EQ(Zyr::bdfWriteItem(&writer, ZyrRmCString(L"Fläche ✓")), Hsys::eSuccess);
    HsDbBdfFiler reader(writer.bytes(), nullptr);
    ZyrRmCString text;
    ASSERT_EQ(Zyr::bdfReadItem(&reader, text), Hsys::eSuccess);
    EXPECT_EQ(text, L"Fläche ✓");
    const std::vector<std::uint8_t> shortened(writer.bytes().begin(), writer.bytes().end() - 1);
    HsDbBdfFiler truncated(shortened, nullptr);
    ZyrRmCString kept(L"kept");
    EXPECT_EQ(Zyr::bdfReadItem(&truncated, kept), Hsys::eFilerError);
    EXPECT_EQ(kept, L"kept");
}

class ZyrNestedObject : public ::testing::Test {
protected:
    // A held object that a failed read must leave in place.
    void SetUp() override {
        auto* record = new ZyrImpDictRecord;
        held.reset(record);
        ASSERT_EQ(record->setName(L"held"), Hsys::eSuccess);
    }

    // The filer stays for the caller to inspect.
    Hsys::ErrorStatus read(const std::vector<std::uint8_t>& bytes, unsigned short version = 80) {
        filer = std::make_unique<HsDbBdfFiler>(bytes, &database);
        ZyrImpObj* object = held.get();
        const Hsys::ErrorStatus status = Zyr::readObject(filer.get(), &owner, object, version);
        if (object != held.get()) {
            static_cast<void>(held.release());
            held.reset(object);
        }
        return status;
    }

    static std::vector<std::uint8_t> filed(const ZyrImpObj* object) {
        HsDbBdfFiler writer;
        EXPECT_EQ(Zyr::writeObject(&writer, object, 80), Hsys::eSuccess);
        return writer.bytes();
    }

    HsDbDatabase database{HsDb::kEmptyDatabase};
    ZyrImpDictRecord owner;
    std::unique_ptr<ZyrImpObj> held;
    std::unique_ptr<HsDbBdfFiler> filer;
};

TEST_F(ZyrNestedObject, aClassWithANumberIsFiledByItElseByName) {
    ZyrGeProfile profile;
    std::vector<std::uint8_t> byName = filed(&profile);
    const std::wstring name = L"ZyrGeProfile";
    ASSERT_GT(byName.size(), 6 + 4 * name.size());
    EXPECT_EQ(std::vector<std::uint8_t>(byName.begin(), byName.begin() + 6),
              (std::vector<std::uint8_t>{2, 0, static_cast<std::uint8_t>(name.size()), 0, 0, 0}));
    ASSERT_EQ(read(byName), Hsys::eSuccess);
    EXPECT_NE(ZyrGeProfile::cast(held.get()), nullptr);
    EXPECT_EQ(held->impParent(), &owner);

    ASSERT_TRUE(ZyrClassIdManager::append(ZyrGeProfile::desc(), 6001));
    const std::vector<std::uint8_t> byNumber = filed(&profile);
    ZyrClassIdManager::remove(ZyrGeProfile::desc());
    EXPECT_EQ(std::vector<std::uint8_t>(byNumber.begin(), byNumber.begin() + 4), le16(1, 6001));
    // A number word in place of a count and the characters.
    EXPECT_EQ(byNumber.size(), byName.size() - 2 - 4 * name.size());
}

TEST_F(ZyrNestedObject, hostileHeadsAreRefusedAndTheHeldObjectStays) {
    const struct {
        const char* name;
        std::vector<std::uint8_t> bytes;
        Hsys::ErrorStatus status;
        Hsys::ErrorStatus filerStatus;
    } cases[] = {
        {"no head", {}, Hsys::eFilerError, Hsys::eFilerError},
        {"half a kind", {1}, Hsys::eFilerError, Hsys::eFilerError},
        {"a kind that is none", le16(3, 0), Hsys::eFilerError, Hsys::eFilerError},
        {"an unknown number", le16(1, 65000), Hsys::eNewerVersion, Hsys::eSuccess},
        {"a number without its word", {1, 0, 9}, Hsys::eFilerError, Hsys::eFilerError},
        {"an unknown name", byName(L"Q"), Hsys::eNewerVersion, Hsys::eSuccess},
        {"a class that is no implementation class", byName(L"HsDbDictionary"), Hsys::eWrongClass,
         Hsys::eFilerError},
        {"a name longer than the stream",
         {2, 0, 9, 0, 0, 0, 'Q', 0, 0, 0},
         Hsys::eFilerError,
         Hsys::eFilerError},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(read(c.bytes), c.status) << c.name;
        EXPECT_EQ(filer->filerStatus(), c.filerStatus) << c.name;
        ASSERT_NE(ZyrImpDictRecord::cast(held.get()), nullptr) << c.name;
        EXPECT_EQ(ZyrImpDictRecord::cast(held.get())->name(), L"held") << c.name;
    }
}

TEST_F(ZyrNestedObject, aTypedPlaceTakesItsClassOnlyAndRefusesOthersBeforeTheirFields) {
    ZyrGeProfile source;
    HsDbBdfFiler profileReader(filed(&source), &database);
    ZyrGeProfile* profile = nullptr;
    ASSERT_EQ(Zyr::readObject(&profileReader, &owner, profile, 80), Hsys::eSuccess);
    ASSERT_NE(profile, nullptr);
    EXPECT_EQ(profile->impParent(), &owner);
    HsDbBdfFiler recordReader(filed(held.get()), &database);
    EXPECT_EQ(Zyr::readObject(&recordReader, &owner, profile, 80), Hsys::eWrongClass);
    EXPECT_EQ(recordReader.filerStatus(), Hsys::eFilerError);
    EXPECT_LT(recordReader.remaining(), recordReader.bytes().size());
    EXPECT_EQ(recordReader.position(), 6u + 4u * std::wstring(L"ZyrImpDictRecord").size())
        << "stopped after the class name";
    delete profile;
}

TEST_F(ZyrNestedObject, everyTruncationOfANestedObjectFailsAndKeepsTheHeldOne) {
    ZyrImpDictRecord source;
    ASSERT_EQ(source.setName(L"nested"), Hsys::eSuccess);
    const std::vector<std::uint8_t> bytes = filed(&source);
    for (std::size_t length = 0; length < bytes.size(); ++length) {
        EXPECT_EQ(read({bytes.begin(), bytes.begin() + long(length)}), Hsys::eFilerError)
            << "length " << length;
        EXPECT_EQ(ZyrImpDictRecord::cast(held.get())->name(), L"held") << "length " << length;
    }
    ASSERT_EQ(read(bytes), Hsys::eSuccess);
    EXPECT_EQ(ZyrImpDictRecord::cast(held.get())->name(), L"nested");
}

TEST_F(ZyrNestedObject, aContainerOfALaterVersionIsNotReadAndNotWrittenAndNullRoundTrips) {
    ZyrImpDictRecord source;
    EXPECT_EQ(read(filed(&source), 81), Hsys::eNewerVersion);
    EXPECT_EQ(filer->position(), 0u);
    HsDbBdfFiler writer;
    EXPECT_EQ(Zyr::writeObject(&writer, &source, 81), Hsys::eBadArgument);
    EXPECT_TRUE(writer.bytes().empty());
    EXPECT_EQ(read(filed(&source), 30), Hsys::eSuccess) << "an older container";
    EXPECT_EQ(filed(nullptr), (std::vector<std::uint8_t>{0, 0}));
    ASSERT_EQ(read(filed(nullptr)), Hsys::eSuccess);
    EXPECT_EQ(held, nullptr) << "a null object replaces the held one";
}

} // namespace
