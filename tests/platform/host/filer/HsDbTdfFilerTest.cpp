// The text filer: items in order, the end of input, one push back, typed values, first error.
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbEntity.h"

#include <gtest/gtest.h>

namespace {

TEST(HsDbTdfFiler, readsItemsInOrderPushesOneBackAndEndsWithEndOfInput) {
    HsDbTdfFiler filer(HsDb::kCopyFiler, true);
    EXPECT_EQ(filer.writeItem({1, L"Wohnen"}), Hsys::eSuccess);
    EXPECT_EQ(filer.writeItem({40, 2.5}), Hsys::eSuccess);
    EXPECT_EQ(filer.writeItem({171, 3}), Hsys::eSuccess);

    HsDbTdfItem item;
    ASSERT_EQ(filer.readItem(item), Hsys::eSuccess);
    EXPECT_EQ(item, HsDbTdfItem(1, L"Wohnen"));
    ASSERT_EQ(filer.readItem(item), Hsys::eSuccess);
    EXPECT_EQ(filer.pushBackItem(), Hsys::eSuccess);
    EXPECT_EQ(filer.pushBackItem(), Hsys::eDoesNotApply) << "one item goes back, not two";
    ASSERT_EQ(filer.readItem(item), Hsys::eSuccess);
    EXPECT_EQ(item, HsDbTdfItem(40, 2.5));
    ASSERT_EQ(filer.readItem(item), Hsys::eSuccess);
    EXPECT_EQ(filer.readItem(item), Hsys::eEndOfInput);
    EXPECT_EQ(filer.readItem(item), Hsys::eEndOfInput);
    EXPECT_EQ(item, HsDbTdfItem(171, 3)) << "the end leaves the last item alone";
    EXPECT_EQ(filer.pushBackItem(), Hsys::eSuccess) << "the last item read goes back at the end";
    ASSERT_EQ(filer.readItem(item), Hsys::eSuccess);
    EXPECT_EQ(item.groupCode(), 171);
}

TEST(HsDbTdfFiler, anItemGivesOnlyTheTypeItHolds) {
    const std::pair<HsDbTdfItem, HsDbTdfItem::Kind> cases[] = {
        {{1, L"x"}, HsDbTdfItem::kText},
        {{40, 1.0}, HsDbTdfItem::kReal},
        {{70, 1}, HsDbTdfItem::kInteger},
        {{330, HsDbObjectId()}, HsDbTdfItem::kObjectId},
    };
    for (const auto& [item, kind] : cases) {
        EXPECT_EQ(item.kind(), kind) << "group code " << item.groupCode();
        std::int32_t integer = 0;
        double real = 7.0;
        std::wstring text;
        HsDbObjectId id;
        const int held =
            (item.getInteger(integer) == Hsys::eSuccess) + (item.getReal(real) == Hsys::eSuccess) +
            (item.getText(text) == Hsys::eSuccess) + (item.getObjectId(id) == Hsys::eSuccess);
        EXPECT_EQ(held, 1) << "group code " << item.groupCode();
        if (kind != HsDbTdfItem::kReal) {
            EXPECT_EQ(real, 7.0) << "a refused read leaves its output alone";
        }
    }
    double real = 0.0;
    EXPECT_EQ(HsDbTdfItem(70, 1).getReal(real), Hsys::eWrongType);
}

TEST(HsDbTdfFiler, theFirstErrorAndItsMessageStay) {
    HsDbTdfFiler filer(std::vector<HsDbTdfItem>{{1, L"a"}}, HsDb::kFileFiler, false);
    filer.setError(Hsys::eBadTdfSequence, L"text drawing files do not carry these objects");
    filer.setError(Hsys::eBadArgument, L"later");
    EXPECT_EQ(filer.filerStatus(), Hsys::eBadTdfSequence);
    EXPECT_EQ(filer.errorMessage(), L"text drawing files do not carry these objects");
    HsDbTdfItem item;
    EXPECT_EQ(filer.readItem(item), Hsys::eBadTdfSequence);
    EXPECT_EQ(filer.writeItem({2, L"b"}), Hsys::eBadTdfSequence);
    filer.resetFilerStatus();
    EXPECT_EQ(filer.readItem(item), Hsys::eSuccess);
}

TEST(HsDbTdfFiler, entityFieldsRoundTripAndAWrongTypeFailsTheFiler) {
    HsDbDatabase db;
    HsDbTdfFiler out(HsDb::kCopyFiler, true);
    HsDbEntity source;
    source.setDatabaseDefaults(&db);
    ASSERT_EQ(source.tdfOut(&out), Hsys::eSuccess);
    ASSERT_EQ(out.items().size(), 2u) << "owner and layer";
    EXPECT_EQ(out.items()[1], HsDbTdfItem(347, db.currentLayerId()));
    HsDbTdfFiler in(out.items(), HsDb::kCopyFiler, true);
    HsDbEntity target;
    ASSERT_EQ(target.tdfIn(&in), Hsys::eSuccess);
    EXPECT_EQ(target.layerId(), db.currentLayerId());

    HsDbTdfFiler hostile(std::vector<HsDbTdfItem>{{330, HsDbObjectId()}, {347, L"not an id"}},
                         HsDb::kCopyFiler, true);
    EXPECT_EQ(target.tdfIn(&hostile), Hsys::eBadTdfSequence);
    EXPECT_EQ(target.layerId(), db.currentLayerId()) << "the refused read changed nothing";
}

} // namespace
