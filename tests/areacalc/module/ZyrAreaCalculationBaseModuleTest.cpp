// The module's parts under its service: the text table, the run-time classes of the calculation
// core, the singleton factories, the base service and the per-database packet.
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrHsDbDatabaseValuator.h"
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/module/ZyrAreaCalculationBaseSingletonFactory.h"
#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

#include <cwctype>
#include <functional>
#include <memory>
#include <stdexcept>

namespace {

TEST(ZyrAreaCalculationBaseTexts, everyNumberHasOneTidyWordingThatResolvesWhileRegistered) {
    const auto& table = ZyrAreaCalculationBaseTexts::table();
    EXPECT_EQ(table.size(), ZyrAreaCalculationBaseTexts::entryCount()) << "a number written twice";
    for (const auto& [id, wording] : table) {
        ASSERT_FALSE(wording.empty()) << id;
        EXPECT_FALSE(std::iswspace(static_cast<wint_t>(wording.front()))) << id;
        EXPECT_FALSE(std::iswspace(static_cast<wint_t>(wording.back()))) << id;
    }
    ZyrAreaCalculationBaseTexts::registerTexts();
    const wchar_t* app = ZyrAreaCalculationBaseTexts::kAppName;
    EXPECT_EQ(ZyrRmCString(app, 29027, false), L"Net area");
    // The migration's new name for a style whose name is taken.
    ZyrRmCString renamed;
    renamed.FormatMessage(ZyrRmCString(app, 29059, false), L"Office", L"Area Style");
    EXPECT_EQ(renamed, L"Office (from Area Style)");
    ZyrAreaCalculationBaseTexts::unregisterTexts();
    EXPECT_NE(ZyrRmCString(app, 29007, false).Find(L"29007"), -1);
}

TEST(ZyrAreaCalculationClassRegistration, classesStandAsTheClassTableSays) {
    ZyrAreaCalculationTestModule::registerClasses();
    using Desc = HsRxClass* (*)();
    const std::tuple<Desc, const wchar_t*, const wchar_t*, int, bool, int, int> table[] = {
        {ZyrAreaCalculationAlgorithm::desc, L"ZyrAreaCalculationAlgorithm", L"HsRxObject", 0, false,
         -1, -1},
        {ZyrAreaCalculationAreaAlgorithm::desc, L"ZyrAreaCalculationAreaAlgorithm",
         L"ZyrAreaCalculationAlgorithm", 80, true, 29005, 28964},
        {ZyrAreaCalculationBaseService::desc, L"ZyrAreaCalculationBaseService", L"HsRxService", 0,
         false, -1, -1},
        {ZyrAreaCalculationHdxServices::desc, L"ZyrAreaCalculationHdxServices", L"HsRxService", 0,
         false, -1, -1},
        {ZyrAreaCalculationPerimeterAlgorithm::desc, L"ZyrAreaCalculationPerimeterAlgorithm",
         L"ZyrAreaCalculationAlgorithm", 80, true, 29006, 28965},
        {ZyrDatabaseDataZyrAreaCalculationBase::desc, L"ZyrDatabaseDataZyrAreaCalculationBase",
         L"ZyrDatabaseData", 80, true, -1, -1},
    };
    for (const auto& [desc, name, parent, flags, creatable, nameText, secondText] : table) {
        const HsRxClass* cls = desc();
        ASSERT_NE(cls, nullptr) << name;
        EXPECT_EQ(hsrxFindHsRxClass(name), cls);
        EXPECT_STREQ(cls->myParent()->name(), parent) << name;
        EXPECT_EQ(cls->proxyFlags(), flags) << name;
        EXPECT_STREQ(cls->recordName(), L"") << name;
        std::unique_ptr<HsRxObject> made(cls->create());
        EXPECT_EQ(made != nullptr ? made->isA() : nullptr, creatable ? cls : nullptr);
        const ZyrRxClassDecorator* decorator = ZyrDecoratorManager::find(cls);
        ASSERT_NE(decorator, nullptr) << name;
        EXPECT_EQ(std::pair(decorator->displayNameId(), decorator->secondTextId()),
                  std::pair(nameText, secondText))
            << name;
    }
    EXPECT_EQ(ZyrAreaCalculationPerimeterAlgorithm::rxInit(),
              ZyrAreaCalculationPerimeterAlgorithm::desc())
        << "registering again keeps the class";
}

// The check is shared by every class of the module, the filed pairs included.
TEST(ZyrAreaCalculationClassRegistrationDeathTest, anotherClassUnderTheNameEndsTheProcess) {
    ZyrAreaCalculationTestModule::registerClasses();
    EXPECT_DEATH(
        {
            // The registered class is taken out of the class dictionary, but stays alive.
            HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxClassDictionary))
                ->remove(L"ZyrAreaCalculationBaseService");
            newHsRxClass(L"ZyrAreaCalculationBaseService", L"HsRxService");
            ZyrAreaCalculationBaseService::rxInit();
        },
        "Class mismatch");
}

// A class whose pseudo constructor does what the test at hand asks of it.
std::function<HsRxObject*()> gMake;
int gAlive = 0;
class Made : public HsRxObject {
    HSRX_DECLARE_MEMBERS(Made)

public:
    Made() { ++gAlive; }
    ~Made() override { --gAlive; }
};
HsRxObject* makeMade() {
    return gMake();
}
HSRX_DEFINE_MEMBERS(Made, HsRxObject, 0, makeMade)

TEST(ZyrAreaCalculationBaseSingletonFactory, makesEachInstanceOnceAndDeletesThemAll) {
    int calls = 0;
    auto factory = std::make_unique<ZyrAreaCalculationBaseSingletonFactory>();
    gMake = [&]() -> HsRxObject* { throw std::runtime_error(std::to_string(++calls)); };
    EXPECT_THROW(factory->instance(Made::desc()), std::runtime_error);
    gMake = [&]() -> HsRxObject* { return ++calls, new Made; };
    HsRxObject* made = factory->instance(Made::desc());
    EXPECT_EQ(factory->instance(Made::desc()), made);
    EXPECT_EQ(calls, 2) << "a failed make stores nothing, a made one is kept";
    EXPECT_EQ(factory->instance(nullptr), nullptr);
    std::vector<HsRxClass*> keys{nullptr};
    factory->keys(keys);
    EXPECT_EQ(keys, (std::vector<HsRxClass*>{nullptr, Made::desc()})) << "appended, null not added";
    factory.reset();
    EXPECT_EQ(gAlive, 0);

    // A class that makes nothing keeps its null and is not asked again.
    factory = std::make_unique<ZyrAreaCalculationBaseSingletonFactory>();
    gMake = [&]() -> HsRxObject* { return ++calls, nullptr; };
    EXPECT_EQ(factory->instance(Made::desc()), nullptr);
    EXPECT_EQ(factory->instance(Made::desc()), nullptr);
    EXPECT_EQ(calls, 3);
}

TEST(ZyrAreaCalculationBaseSingletonFactory, serviceStartsWithTheTwoAlgorithmsAndNoDecompositor) {
    ZyrAreaCalculationHdxServices& services = ZyrAreaCalculationTestModule::services();
    ZyrAreaCalculationBaseSingletonFactory* algorithms = services.algorithmFactory();
    HsRxClass* area = ZyrAreaCalculationAreaAlgorithm::desc();
    HsRxClass* perimeter = ZyrAreaCalculationPerimeterAlgorithm::desc();
    // In the order of the descriptors' addresses, appended to what the caller has.
    const auto ordered = std::less<>()(area, perimeter) ? std::vector{area, perimeter}
                                                        : std::vector{perimeter, area};
    std::vector<HsRxClass*> keys;
    algorithms->keys(keys);
    EXPECT_EQ(keys, ordered);
    std::vector<HsRxClass*> available{nullptr};
    ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(available);
    EXPECT_EQ(available, (std::vector<HsRxClass*>{nullptr, ordered[0], ordered[1]}));
    EXPECT_NE(ZyrAreaCalculationAreaAlgorithm::cast(algorithms->instance(area)), nullptr);
    EXPECT_NE(ZyrAreaCalculationPerimeterAlgorithm::cast(algorithms->instance(perimeter)), nullptr);
    // Without decomposition the area algorithm has no formula patterns to offer.
    EXPECT_EQ(services.expressionHandlerFactory(), nullptr);
    keys.clear();
    services.decompositorFactory()->keys(keys);
    EXPECT_TRUE(keys.empty());
}

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
    EXPECT_EQ(service.getOpenDatabaseInfo(databases, false, Valuator(true)), Hsys::eDoesNotApply);
    EXPECT_EQ(databases,
              (ZyrAreaCalculationBaseService::DatabaseInfoVector{{&working, L"Current Drawing"}}));
    // A drawing whose display system was never set up does not take part in previews.
    EXPECT_FALSE(ZyrHsDbDatabaseValuatorDisplaySystem().isDatabaseValid(&working));
    EXPECT_EQ(service.bitmap(nullptr, HsDbObjectId::kNull, 10, 10, 8), nullptr);
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
}

TEST(ZyrAreaCalculationBaseService, registeredReplacementWinsOverTheFallbackOnEveryCall) {
    ZyrAreaCalculationHdxServices& services = ZyrAreaCalculationTestModule::services();
    HsRxDictionary& dictionary =
        *HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
    const wchar_t* key = ZyrAreaCalculationBaseService::serviceName();
    EXPECT_STREQ(key, L"ZyrAreaCalculationBaseService");
    ZyrAreaCalculationBaseService* fallback = services.baseService();
    ASSERT_NE(fallback, nullptr);
    HsRxService unrelated;
    ZyrAreaCalculationBaseService replacement;
    for (const auto& [entry, expected] :
         {std::pair<HsRxService*, ZyrAreaCalculationBaseService*>{&unrelated, fallback},
          {&replacement, &replacement}}) {
        dictionary.atPut(key, entry);
        EXPECT_EQ(services.baseService(), expected);
    }
    dictionary.remove(key);
    EXPECT_EQ(services.baseService(), fallback);
}

TEST(ZyrDatabaseDataZyrAreaCalculationBase, eachDrawingHasOnePacketAndNullMeansTheWorkingOne) {
    using Packet = ZyrDatabaseDataZyrAreaCalculationBase;
    ZyrAreaCalculationTestModule::services();
    HsDbDatabase working;
    HsDbDatabase other;
    hsdbHostApplicationServices()->setWorkingDatabase(&working);
    Packet* packet = Packet::instance(nullptr);
    ASSERT_NE(packet, nullptr);
    EXPECT_EQ(packet->database(), &working);
    EXPECT_EQ(Packet::instance(&working), packet);
    EXPECT_NE(Packet::instance(&other), packet);
    hsdbHostApplicationServices()->setWorkingDatabase(&other);
    EXPECT_EQ(Packet::instance(nullptr), Packet::instance(&other));
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);

    // Dynamic properties are enabled until turned off: each step sets a key, then reads 5 and 7.
    Packet own;
    EXPECT_TRUE(own.dynPropEnableValue(5));
    for (const auto& [key, value, five, seven] :
         {std::tuple(5, false, false, true), {7, false, false, false}, {5, true, true, false}}) {
        own.dynPropEnableValue(key, value);
        EXPECT_EQ(std::pair(own.dynPropEnableValue(5), own.dynPropEnableValue(7)),
                  std::pair(five, seven));
    }
}

} // namespace
