// The run-time classes of the calculation core and the service, registered through their
// decorators with the names, parents, flags and texts of the module's class table.
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

TEST(ZyrAreaCalculationClassRegistration, classesStandAsTheClassTableSays) {
    ZyrAreaCalculationTestModule::registerClasses();
    const struct {
        HsRxClass* (*desc)();
        const wchar_t* name;
        const wchar_t* parent;
        int flags;
        bool creatable;
        int nameText;
        int secondText;
    } table[] = {
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
    for (const auto& row : table) {
        const HsRxClass* cls = row.desc();
        ASSERT_NE(cls, nullptr) << row.name;
        EXPECT_EQ(hsrxFindHsRxClass(row.name), cls);
        EXPECT_STREQ(cls->myParent()->name(), row.parent) << row.name;
        EXPECT_EQ(cls->proxyFlags(), row.flags) << row.name;
        EXPECT_STREQ(cls->recordName(), L"") << row.name;
        std::unique_ptr<HsRxObject> made(cls->create());
        EXPECT_EQ(made != nullptr, row.creatable) << row.name;
        if (made != nullptr) {
            EXPECT_EQ(made->isA(), cls);
        }
        const ZyrRxClassDecorator* decorator = ZyrDecoratorManager::find(cls);
        ASSERT_NE(decorator, nullptr) << row.name;
        EXPECT_EQ(decorator->displayNameId(), row.nameText) << row.name;
        EXPECT_EQ(decorator->secondTextId(), row.secondText) << row.name;
    }
    EXPECT_EQ(ZyrAreaCalculationPerimeterAlgorithm::rxInit(),
              ZyrAreaCalculationPerimeterAlgorithm::desc())
        << "registering again keeps the class";
}

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

} // namespace
