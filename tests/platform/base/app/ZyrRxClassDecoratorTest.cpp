// Decorators: a module's class table registered in construction order, and display names from
// the module's texts.
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/base/res/ZyrTextResources.h"
#include "platform/host/rx/HsRxClass.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace {

HsModuleHandle gModule = nullptr;
std::vector<std::wstring> gOrder;

class Base : public HsRxObject {};
class Derived : public Base {};

HsRxClass* baseDesc() {
    return hsrxFindHsRxClass(L"DecoBase");
}
HsRxClass* derivedDesc() {
    return hsrxFindHsRxClass(L"DecoDerived");
}
HsRxClass* baseInit() {
    gOrder.push_back(L"DecoBase");
    return baseDesc() ? baseDesc() : newHsRxClass(L"DecoBase", L"HsRxObject", 0);
}
HsRxClass* derivedInit() {
    gOrder.push_back(L"DecoDerived");
    return derivedDesc() ? derivedDesc() : newHsRxClass(L"DecoDerived", L"DecoBase", 80);
}

TEST(ZyrRxClassDecorator, registersAModulesClassesInConstructionOrderAndLeavesWhenGone) {
    const size_t before = ZyrDecoratorManager::decorators().size();
    int handleValues[2] = {};
    HsModuleHandle otherModule = &handleValues[1];
    gModule = &handleValues[0]; // attached after the decorators were built
    auto base = std::make_unique<ZyrRxClassDecorator>(typeid(Base), typeid(HsRxObject), baseInit,
                                                      baseDesc, &gModule, 500, 501);
    ZyrRxClassDecorator derived(typeid(Derived), typeid(Base), derivedInit, derivedDesc, &gModule,
                                502, ZyrRxClassDecorator::kNoText);
    ZyrRxClassDecorator foreign(typeid(Derived), typeid(Base), derivedInit, derivedDesc,
                                &otherModule, -1, -1);
    gOrder.clear();
    EXPECT_EQ(ZyrDecoratorManager::registerClasses(gModule), 2);
    EXPECT_EQ(gOrder, (std::vector<std::wstring>{L"DecoBase", L"DecoDerived"}));
    ASSERT_NE(derivedDesc(), nullptr);
    EXPECT_TRUE(derivedDesc()->isDerivedFrom(baseDesc()));

    ZyrTextResources::registerTable(L"DecoApp", {{500, L"Base thing"}, {501, L"About base"}});
    ZyrDecoratorManager::bindModule(gModule, L"DecoApp");
    ZyrRmCString text;
    EXPECT_TRUE(ZyrDecoratorManager::secondText(baseDesc(), text));
    EXPECT_EQ(text, L"About base");
    EXPECT_FALSE(ZyrDecoratorManager::secondText(derivedDesc(), text)) << "-1 is no text";
    EXPECT_EQ(text, L"About base") << "a failed lookup leaves the text alone";
    EXPECT_TRUE(ZyrDecoratorManager::displayName(derivedDesc(), text));
    EXPECT_NE(text.Find(L"502"), -1) << "a missing wording is a placeholder naming its number";
    Zyr::classTypeToDisplayName(baseDesc(), text);
    EXPECT_EQ(text, L"Base thing");
    ZyrDecoratorManager::unbindModule(gModule);
    ZyrTextResources::unregisterTable(L"DecoApp");
    deleteHsRxClass(derivedDesc());
    deleteHsRxClass(baseDesc());

    base.reset();
    EXPECT_EQ(ZyrDecoratorManager::decorators().size(), before + 2);
    EXPECT_EQ(ZyrDecoratorManager::decorators().back(), &foreign);
}

} // namespace
