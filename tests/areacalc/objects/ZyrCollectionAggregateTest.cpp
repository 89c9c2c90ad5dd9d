// Collections of classes: which adds change them, in which order, and how they are filed.
#include "areacalc/objects/ZyrCollectionFiler.h"
#include "areacalc/objects/ZyrUniqueCollectionAggregate.h"
#include "platform/host/db/HsDbObject.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace {

using Classes = ZyrUniqueCollectionAggregate<HsRxClass*>;

// Three classes in the order of their addresses, and a collection of the last and the first.
struct ThreeClasses : ::testing::Test {
    void SetUp() override {
        std::sort(c.begin(), c.end());
        ASSERT_EQ(held.add(c[2]), Hsys::eSuccess);
        ASSERT_EQ(held.add(c[0]), Hsys::eSuccess);
    }
    std::vector<HsRxClass*> c = {HsRxObject::desc(), HsRxClass::desc(), HsDbObject::desc()};
    Classes held;
};

TEST_F(ThreeClasses, uniqueAddRefusesWhatIsHeldAndSortsOnlyWhenAListBringsSomethingNew) {
    EXPECT_EQ(held.add(c[2]), Hsys::eBadArgument);
    EXPECT_EQ(held.items(), (std::vector<HsRxClass*>{c[2], c[0]})) << "appended, not sorted";
    ZyrCollectionAggregate<HsRxClass*> plain;
    EXPECT_EQ(plain.add(c[1]), Hsys::eSuccess);
    EXPECT_EQ(plain.add(c[1]), Hsys::eSuccess);
    EXPECT_EQ(plain.count(), 2);

    const std::tuple<std::vector<HsRxClass*>, std::vector<HsRxClass*>> cases[] = {
        {{}, {c[2], c[0]}},
        {{c[0], c[2], c[0]}, {c[2], c[0]}},
        {{c[1]}, {c[0], c[1], c[2]}},
        {{c[1], c[1], nullptr}, {nullptr, c[0], c[1], c[2]}}};
    for (const auto& [added, expected] : cases) {
        Classes classes = held;
        EXPECT_EQ(classes.add(added), Hsys::eSuccess);
        EXPECT_EQ(classes.items(), expected) << added.size();
    }
}

TEST_F(ThreeClasses, areFiledByNameAndNamesOfNoClassReadAsNull) {
    HsDbBdfFiler stream;
    ASSERT_EQ(ZyrCollectionFiler::bdfWriteTranslated(&stream, ZyrCollectionFiler::RxClassAsString(),
                                                     held),
              Hsys::eSuccess);
    stream.writeString(L"ZyrNoSuchClass");
    std::vector<std::uint8_t> bytes = stream.bytes();
    bytes[0] = 3; // the count, now with the name of no class

    const auto read = [](const std::vector<std::uint8_t>& from, Classes& into) {
        HsDbBdfFiler reader(from, nullptr);
        return ZyrCollectionFiler::bdfReadTranslated(&reader, ZyrCollectionFiler::RxClassAsString(),
                                                     into);
    };
    Classes classes;
    ASSERT_EQ(read(bytes, classes), Hsys::eSuccess);
    EXPECT_EQ(classes.items(), (std::vector<HsRxClass*>{nullptr, c[0], c[2]}));

    // A short stream, or a count that the bytes cannot hold, changes nothing.
    std::vector<std::uint8_t> lying = bytes;
    lying[3] = 0xFF; // a count no stream of this size can hold
    for (const auto& bad : {std::vector<std::uint8_t>(bytes.begin(), bytes.end() - 1), lying}) {
        Classes kept = held;
        EXPECT_EQ(read(bad, kept), Hsys::eFilerError);
        EXPECT_EQ(kept, held);
    }
}

} // namespace
