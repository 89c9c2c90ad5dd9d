// The binary filer and the list filing: exact bytes, round trips, and every truncation of a
// valid stream failing cleanly without a read past the end.
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>

namespace {

using Bytes = std::vector<std::uint8_t>;

TEST(HsDbBdfFiler, writesLittleEndianValuesWithoutTags) {
    HsDbDatabase db(HsDb::kEmptyDatabase, HsDb::kNoTransactions);
    HsDbObjectId id;
    ASSERT_EQ(db.getHsDbObjectId(id, true, 0x0102), Hsys::eSuccess);
    HsDbBdfFiler filer(&db);
    filer.writeInt16(-2);
    filer.writeUInt16(0x1234);
    filer.writeInt32(-1);
    filer.writeUInt32(0x0A0B0C0D);
    filer.writeDouble(1.0);
    filer.writeBool(true);
    filer.writeBool(false);
    filer.writeString(L"A\u00e4");
    filer.writeString(static_cast<const wchar_t*>(nullptr));
    filer.writeHardPointerId(id);
    filer.writeSoftPointerId(HsDbObjectId());
    HsDbFilerSupport::bdfWriteHardPointerVector(&filer, {id, {}});
    const Bytes expected = {0xFE, 0xFF, 0x34, 0x12, 0xFF, 0xFF, 0xFF, 0xFF, 0x0D, 0x0C, 0x0B,
                            0x0A,                                                 // 16 and 32 bits
                            0, 0, 0, 0, 0, 0, 0xF0, 0x3F, 1, 0,                   // double,
                                                                                  // bools
                            2, 0, 0, 0, 0x41, 0, 0, 0, 0xE4, 0, 0, 0, 0, 0, 0, 0, // text, null text
                            0x02, 0x01, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, // id, null id
                            2, 0, 0, 0, 0x02, 0x01, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0,
                            0}; // id vector
    EXPECT_EQ(filer.bytes(), expected);
}

// A gadget with every field set, in a database where its references point at real objects.
class GadgetStream : public testing::Test {
protected:
    void SetUp() override {
        for (HsDbObjectId* id : {&partner, &child, &neighbour})
            *id = addGadget(db);
        source.count = -12;
        source.flags = 0xBEEF;
        source.offset = -70000;
        source.serial = 4000000000u;
        source.length = 12.375;
        source.visible = true;
        source.label = L"Fl\u00e4che 1";
        source.anchor = {1.5, -2.5};
        source.position = {3.0, 4.0, -5.0};
        source.tag[0] = 7;
        source.tag[2] = 9;
        source.partner = partner;
        source.child = child;
        source.neighbours = {neighbour, HsDbObjectId(), partner};
        source.names = {L"Wohnen", L"", L"K\u00fcche"};
    }

    Bytes streamOf(const TestGadget& gadget) {
        HsDbBdfFiler filer(&db);
        EXPECT_EQ(gadget.bdfOutFields(&filer), Hsys::eSuccess);
        return filer.bytes();
    }

    HsDbDatabase db;
    HsDbObjectId partner, child, neighbour;
    TestGadget source;
};

TEST_F(GadgetStream, everyFieldComesBackAndEveryTruncationFailsWithoutReadingPastTheEnd) {
    const Bytes full = streamOf(source);
    HsDbBdfFiler reader(full, &db);
    TestGadget copy;
    ASSERT_EQ(copy.bdfInFields(&reader), Hsys::eSuccess);
    EXPECT_EQ(reader.remaining(), 0u);
    // With the golden bytes above pinning the writer, an equal stream means equal fields.
    EXPECT_EQ(streamOf(copy), full);

    for (std::size_t length = 0; length < full.size(); ++length) {
        // An exact-size copy, so that the address sanitizer sees any read past the end.
        HsDbBdfFiler cut(Bytes(full.begin(), full.begin() + static_cast<long>(length)), &db);
        TestGadget target;
        EXPECT_NE(target.bdfInFields(&cut), Hsys::eSuccess) << "cut at " << length;
        EXPECT_EQ(cut.filerStatus(), Hsys::eFilerError) << "cut at " << length;
        EXPECT_LE(cut.position(), length);
    }
}

TEST_F(GadgetStream, aFailedFilerStaysFailedAndLeavesOutputsAlone) {
    HsDbBdfFiler reader(Bytes{1, 2, 3}, &db);
    std::int32_t value = 42;
    EXPECT_EQ(reader.readInt32(value), Hsys::eFilerError);
    EXPECT_EQ(value, 42);
    std::int16_t small = 5;
    EXPECT_EQ(reader.readInt16(small), Hsys::eFilerError) << "two bytes are there, but it failed";
    EXPECT_EQ(small, 5);
    EXPECT_EQ(reader.position(), 0u);
    reader.setFilerStatus(Hsys::eBadArgument);
    EXPECT_EQ(reader.filerStatus(), Hsys::eFilerError) << "the first failure stays";

    HsDbBdfFiler boolReader(Bytes{2}, &db);
    bool flag = false;
    EXPECT_EQ(boolReader.readBool(flag), Hsys::eFilerError) << "a bool is 0 or 1";
}

TEST_F(GadgetStream, countsThatTheBytesCannotHoldAreRefused) {
    const std::pair<const char*, Bytes> cases[] = {
        {"string of 2^32-1 characters", {0xFF, 0xFF, 0xFF, 0xFF, 0x41, 0, 0, 0}},
        {"id vector of 3 with room for 1", {3, 0, 0, 0, 1, 0, 0, 0, 0, 0, 0, 0}},
        {"string vector of 2^31", {0, 0, 0, 0x80}},
    };
    for (const auto& [what, bytes] : cases) {
        std::wstring text = L"kept";
        std::vector<HsDbObjectId> ids{partner};
        std::vector<std::wstring> texts{L"kept"};
        HsDbBdfFiler textReader(bytes, &db);
        HsDbBdfFiler idsReader(bytes, &db);
        HsDbBdfFiler textsReader(bytes, &db);
        EXPECT_EQ(textReader.readString(text), Hsys::eFilerError) << what;
        EXPECT_EQ(HsDbFilerSupport::bdfReadHardPointerVector(&idsReader, ids, true),
                  Hsys::eFilerError)
            << what;
        EXPECT_EQ(HsDbFilerSupport::bdfReadVector(&textsReader, texts), Hsys::eFilerError) << what;
        EXPECT_EQ(text, L"kept") << what;
        EXPECT_EQ(ids, std::vector<HsDbObjectId>{partner}) << what;
        EXPECT_EQ(texts, std::vector<std::wstring>{L"kept"}) << what;
    }
}

TEST_F(GadgetStream, handlesBecomeIdsOfTheReadingDatabase) {
    HsDbBdfFiler writer(&db);
    HsDbFilerSupport::bdfWriteSoftPointerVector(&writer, {partner, neighbour});
    HsDbDatabase other(HsDb::kEmptyDatabase, HsDb::kNoTransactions);
    HsDbBdfFiler reader(writer.bytes(), &other);
    std::vector<HsDbObjectId> ids{HsDbObjectId()};
    ASSERT_EQ(HsDbFilerSupport::bdfReadSoftPointerVector(&reader, ids, false), Hsys::eSuccess);
    ASSERT_EQ(ids.size(), 3u) << "appended behind what was there";
    EXPECT_EQ(ids[1].database(), &other);
    EXPECT_EQ(ids[1].handle(), partner.handle());
    EXPECT_FALSE(ids[1].isValid()) << "known by handle, its object not read yet";

    HsDbBdfFiler withoutDatabase(writer.bytes(), nullptr);
    EXPECT_EQ(HsDbFilerSupport::bdfReadSoftPointerVector(&withoutDatabase, ids, true),
              Hsys::eNoDatabase);
    EXPECT_EQ(ids.size(), 3u);
}

} // namespace
