// The base service: the plain one lists the working drawing and makes no previews, and a
// replacement entered in the service dictionary wins on every call.
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/calc/ZyrHsDbDatabaseValuator.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

namespace {

class Valuator : public ZyrHsDbDatabaseValuator {
public:
    explicit Valuator(bool answer) : m_answer(answer) {}
    bool isDatabaseValid(HsDbDatabase* database) const override {
        return database == hsdbHostApplicationServices()->workingDatabase() && m_answer;
    }

private:
    bool m_answer;
};

TEST(ZyrAreaCalculationBaseService, plainServiceListsTheWorkingDrawingWhenTheValuatorAccepts) {
    HsDbDatabase working;
    hsdbHostApplicationServices()->setWorkingDatabase(&working);
    ZyrAreaCalculationBaseService service;
    ZyrAreaCalculationBaseService::DatabaseInfoVector databases;
    EXPECT_EQ(service.getOpenDatabaseInfo(databases, true, Valuator(false)), Hsys::eDoesNotApply);
    EXPECT_TRUE(databases.empty());
    EXPECT_EQ(service.getOpenDatabaseInfo(databases, false, Valuator(true)), Hsys::eDoesNotApply);
    EXPECT_EQ(databases,
              (ZyrAreaCalculationBaseService::DatabaseInfoVector{{&working, L"Current Drawing"}}));
    // A drawing whose display system was never set up does not take part in previews.
    EXPECT_FALSE(ZyrHsDbDatabaseValuatorDisplaySystem().isDatabaseValid(&working));
    EXPECT_EQ(service.bitmap(nullptr, HsDbObjectId::kNull, 10, 10, 8), nullptr);
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
}

class Replacement : public ZyrAreaCalculationBaseService {};

TEST(ZyrAreaCalculationBaseService, registeredReplacementWinsOverTheFallbackOnEveryCall) {
    ZyrAreaCalculationHdxServices& services = ZyrAreaCalculationTestModule::services();
    HsRxDictionary& dictionary =
        *HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
    const wchar_t* key = ZyrAreaCalculationBaseService::serviceName();
    EXPECT_STREQ(key, L"ZyrAreaCalculationBaseService");
    ZyrAreaCalculationBaseService* fallback = services.baseService();
    ASSERT_NE(fallback, nullptr);
    EXPECT_EQ(services.baseService(), fallback);

    HsRxService unrelated;
    Replacement replacement;
    for (const auto& [entry, expected] :
         {std::pair<HsRxService*, ZyrAreaCalculationBaseService*>{&unrelated, fallback},
          {&replacement, &replacement}}) {
        dictionary.atPut(key, entry);
        EXPECT_EQ(services.baseService(), expected);
    }
    dictionary.remove(key);
    EXPECT_EQ(services.baseService(), fallback);
}

} // namespace
