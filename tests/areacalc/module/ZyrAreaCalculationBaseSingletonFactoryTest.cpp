// Singleton factories: one instance per class, kept in the order of the descriptors' addresses,
// and the service's two factories as they come into being.
#include "areacalc/module/ZyrAreaCalculationBaseSingletonFactory.h"
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>

namespace {

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
    EXPECT_EQ(services.algorithmFactory(), algorithms);
    HsRxClass* area = ZyrAreaCalculationAreaAlgorithm::desc();
    HsRxClass* perimeter = ZyrAreaCalculationPerimeterAlgorithm::desc();
    std::vector<HsRxClass*> keys;
    algorithms->keys(keys);
    EXPECT_EQ(keys, (std::less<>()(area, perimeter) ? std::vector{area, perimeter}
                                                    : std::vector{perimeter, area}));
    EXPECT_NE(ZyrAreaCalculationAreaAlgorithm::cast(algorithms->instance(area)), nullptr);
    EXPECT_NE(ZyrAreaCalculationPerimeterAlgorithm::cast(algorithms->instance(perimeter)), nullptr);
    // Without decomposition the area algorithm has no formula patterns to offer.
    EXPECT_EQ(services.expressionHandlerFactory(), nullptr);

    keys.clear();
    services.decompositorFactory()->keys(keys);
    EXPECT_TRUE(keys.empty());
}

} // namespace
