// The sample area that style previews show.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbLayerTable.h"

#include <numbers>

namespace {

using ZyrAreaDbOperationsSample = ZyrAreaDrawing;

TEST_F(ZyrAreaDbOperationsSample, isAPositiveOutlineWithAnArcAndANegativeHoleOnTheAreaLayer) {
    hsdbHostApplicationServices()->setWorkingDatabase(&database);
    std::unique_ptr<ZyrDbArea> sample(ZyrAreaDbOperations::sample(nullptr));
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
    ASSERT_NE(sample, nullptr);
    EXPECT_TRUE(sample->objectId().isNull());
    EXPECT_EQ(sample->styleId(), standardStyle);
    const ZyrGeProfile* profile = sample->profile();
    ASSERT_EQ(profile->ringCount(), 2);
    EXPECT_NEAR(profile->ring(0)->area(), 80.0 + 12.0 * std::numbers::pi, 1e-9);
    EXPECT_NEAR(profile->ring(1)->area(), -22.5, 1e-9);
    EXPECT_TRUE(profile->isValidProfile(true));

    HsDbObjectPointer<HsDbLayerTableRecord> layer(sample->layerId(), HsDb::kForRead);
    const wchar_t* name = nullptr;
    ASSERT_TRUE(layer);
    ASSERT_EQ(layer->getName(name), Hsys::eSuccess);
    EXPECT_STREQ(name, L"AREA");
}

} // namespace
