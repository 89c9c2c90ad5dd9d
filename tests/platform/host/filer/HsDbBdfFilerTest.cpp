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
    struct Case {
        const char* what;
        void (*write)(HsDbBdfFiler&, const HsDbObjectId&);
        Bytes bytes;
    };
    const Case cases[] = {
        {"int16 -2", [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeInt16(-2); }, {0xFE, 0xFF}},
        {"uint16",
         [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeUInt16(0x1234); },
         {0x34, 0x12}},
        {"int32 -1",
         [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeInt32(-1); },
         {0xFF, 0xFF, 0xFF, 0xFF}},
        {"uint32",
         [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeUInt32(0x0A0B0C0D); },
         {0x0D, 0x0C, 0x0B, 0x0A}},
        {"double 1.0",
         [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeDouble(1.0); },
         {0, 0, 0, 0, 0, 0, 0xF0, 0x3F}},
        {"bools",
         [](HsDbBdfFiler& f, const HsDbObjectId&) {
             f.writeBool(true);
             f.writeBool(false);
         },
         {1, 0}},
        {"string",
         [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeString(L"A\u00e4"); },
         {2, 0, 0, 0, 0x41, 0, 0, 0, 0xE4, 0, 0, 0}},
        {"null string",
         [](HsDbBdfFiler& f, const HsDbObjectId&) {
             f.writeString(static_cast<const wchar_t*>(nullptr));
         },
         {0, 0, 0, 0}},
        {"id as handle",
         [](HsDbBdfFiler& f, const HsDbObjectId& i) { f.writeHardPointerId(i); },
         {0x02, 0x01, 0, 0, 0, 0, 0, 0}},
        {"null id",
         [](HsDbBdfFiler& f, const HsDbObjectId&) { f.writeSoftPointerId(HsDbObjectId()); },
         {0, 0, 0, 0, 0, 0, 0, 0}},
        {"id vector",
         [](HsDbBdfFiler& f, const HsDbObjectId& i) {
             HsDbFilerSupport::bdfWriteHardPointerVector(&f, {i, {}});
         },
         {2, 0, 0, 0, 0x02, 0x01, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}},
    };
    for (const Case& c : cases) {
        HsDbBdfFiler filer(&db);
        c.write(filer, id);
        EXPECT_EQ(filer.bytes(), c.bytes) << c.what;
    }
}

// A gadget with every field set, in a database where its references point at real objects.
class GadgetStream : public testing::Test {
protected:
    void SetUp() override {
        for (HsDbObjectId* id : {&partner, &child, &neighbour}) {
            auto* object = new TestGadget;
            ASSERT_EQ(db.addHsDbObject(*id, object), Hsys::eSuccess);
            object->close();
        }
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
    HsDbObjectId partner;
    HsDbObjectId child;
    HsDbObjectId neighbour;
    TestGadget source;
};

TEST_F(GadgetStream, everyFieldComesBackAndTheStreamIsUsedUp) {
    HsDbBdfFiler reader(streamOf(source), &db);
    TestGadget copy;
    ASSERT_EQ(copy.bdfInFields(&reader), Hsys::eSuccess);
    EXPECT_EQ(reader.remaining(), 0u);
    EXPECT_EQ(copy.count, -12);
    EXPECT_EQ(copy.flags, 0xBEEF);
    EXPECT_EQ(copy.offset, -70000);
    EXPECT_EQ(copy.serial, 4000000000u);
    EXPECT_EQ(copy.length, 12.375);
    EXPECT_TRUE(copy.visible);
    EXPECT_EQ(copy.label, L"Fl\u00e4che 1");
    EXPECT_EQ(copy.anchor.x, 1.5);
    EXPECT_EQ(copy.anchor.y, -2.5);
    EXPECT_EQ(copy.position.z, -5.0);
    EXPECT_EQ(copy.tag[0], 7);
    EXPECT_EQ(copy.tag[2], 9);
    EXPECT_EQ(copy.partner, partner);
    EXPECT_EQ(copy.child, child);
    EXPECT_EQ(copy.neighbours, source.neighbours);
    EXPECT_EQ(copy.names, source.names);
}

TEST_F(GadgetStream, everyTruncationFailsWithoutReadingPastTheEnd) {
    const Bytes full = streamOf(source);
    for (std::size_t length = 0; length < full.size(); ++length) {
        // An exact-size copy, so that the address sanitizer sees any read past the end.
        HsDbBdfFiler reader(Bytes(full.begin(), full.begin() + static_cast<long>(length)), &db);
        TestGadget copy;
        EXPECT_NE(copy.bdfInFields(&reader), Hsys::eSuccess) << "cut at " << length;
        EXPECT_EQ(reader.filerStatus(), Hsys::eFilerError) << "cut at " << length;
        EXPECT_LE(reader.position(), length);
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
}

TEST_F(GadgetStream, countsAndValuesThatTheBytesCannotHoldAreRefused) {
    struct Case {
        const char* what;
        Bytes bytes;
    };
    const Case cases[] = {
        {"string of 2^32-1 characters", {0xFF, 0xFF, 0xFF, 0xFF, 0x41, 0, 0, 0}},
        {"id vector of 3 with room for 1", {3, 0, 0, 0, 1, 0, 0, 0, 0, 0, 0, 0}},
        {"string vector of 2^31", {0, 0, 0, 0x80}},
    };
    for (const Case& c : cases) {
        HsDbBdfFiler reader(c.bytes, &db);
        std::wstring text = L"kept";
        std::vector<HsDbObjectId> ids{partner};
        std::vector<std::wstring> texts{L"kept"};
        reader.readString(text);
        HsDbBdfFiler idReader(c.bytes, &db);
        HsDbFilerSupport::bdfReadHardPointerVector(&idReader, ids, true);
        HsDbBdfFiler textReader(c.bytes, &db);
        HsDbFilerSupport::bdfReadVector(&textReader, texts);
        EXPECT_EQ(text, L"kept") << c.what;
        EXPECT_EQ(ids, std::vector<HsDbObjectId>{partner}) << c.what;
        EXPECT_EQ(texts, std::vector<std::wstring>{L"kept"}) << c.what;
        EXPECT_EQ(idReader.filerStatus(), Hsys::eFilerError) << c.what;
        EXPECT_EQ(textReader.filerStatus(), Hsys::eFilerError) << c.what;
    }

    HsDbBdfFiler boolReader(Bytes{2}, &db);
    bool flag = false;
    EXPECT_EQ(boolReader.readBool(flag), Hsys::eFilerError) << "a bool is 0 or 1";
}

TEST_F(GadgetStream, handlesBecomeIdsOfTheReadingDatabase) {
    HsDbBdfFiler writer(&db);
    HsDbFilerSupport::bdfWriteSoftPointerVector(&writer, {partner, neighbour});
    const std::uint64_t partnerHandle = partner.handle();

    HsDbDatabase other(HsDb::kEmptyDatabase, HsDb::kNoTransactions);
    HsDbBdfFiler reader(writer.bytes(), &other);
    std::vector<HsDbObjectId> ids{HsDbObjectId()};
    ASSERT_EQ(HsDbFilerSupport::bdfReadSoftPointerVector(&reader, ids, false), Hsys::eSuccess);
    ASSERT_EQ(ids.size(), 3u) << "appended behind what was there";
    EXPECT_EQ(ids[1].database(), &other);
    EXPECT_EQ(ids[1].handle(), partnerHandle);
    EXPECT_FALSE(ids[1].isValid()) << "known by handle, its object not read yet";

    HsDbBdfFiler withoutDatabase(writer.bytes(), nullptr);
    EXPECT_EQ(HsDbFilerSupport::bdfReadSoftPointerVector(&withoutDatabase, ids, true),
              Hsys::eNoDatabase);
    EXPECT_EQ(ids.size(), 3u);
}

} // namespace
