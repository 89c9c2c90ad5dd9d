// Entities go on the layer of their key, made once and found again without regard to case.
#include "platform/base/app/ZyrEntityLayer.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "tests/platform/base/dict/ZyrDictTestRecords.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrEntityLayer, theKeysLayerIsMadeOnceAndRefusalsChangeNothing) {
    HsDbDatabase db;
    auto layers = [&db] {
        return HsDbObjectPointer<HsDbLayerTable>(db.layerTableId(), HsDb::kForRead)->recordIds();
    };
    const size_t before = layers().size();
    ZyrTestStyledEntity sample; // in no database: the given one, else the working one, serves
    EXPECT_EQ(Zyr::setLayer(&sample), Hsys::eNoDatabase);
    ASSERT_EQ(Zyr::setLayer(&sample, L"area", &db), Hsys::eSuccess);
    ASSERT_EQ(layers().size(), before + 1);
    EXPECT_EQ(HsDbObjectPointer<HsDbLayerTableRecord>(sample.layerId(), HsDb::kForRead)->name(),
              L"area");
    hsdbHostApplicationServices()->setWorkingDatabase(&db);
    ZyrTestStyledEntity other;
    EXPECT_EQ(Zyr::setLayer(&other), Hsys::eSuccess);
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
    EXPECT_EQ(other.layerId(), sample.layerId());

    const HsDbObjectId id = addStyledEntity(db, HsDbObjectId());
    HsDbObjectPointer<ZyrTestStyledEntity> reader(id, HsDb::kForRead);
    EXPECT_EQ(Zyr::setLayer(reader.object()), Hsys::eNotOpenForWrite);
    EXPECT_EQ(reader->layerId(), db.currentLayerId());
    ASSERT_EQ(reader->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(Zyr::setLayer(reader.object(), L"", &db), Hsys::eSuccess);
    EXPECT_EQ(reader->layerId(), db.currentLayerId());
    EXPECT_EQ(Zyr::setLayer(reader.object()), Hsys::eSuccess);
    EXPECT_EQ(reader->layerId(), sample.layerId());
    EXPECT_EQ(layers().size(), before + 1);
    EXPECT_EQ(Zyr::setLayer(static_cast<ZyrDbEntity*>(nullptr)), Hsys::eNullPointer);
}

} // namespace
