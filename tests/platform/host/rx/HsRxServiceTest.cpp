// Services: the root registry, dependency counting, and registration through the linker.
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxDynamicLinker.h"
#include "platform/host/rx/HsRxService.h"
#include "platform/host/rx/HsRxSysRegistry.h"

#include <gtest/gtest.h>

namespace {

HsRxDynamicLinker* linker() {
    return HsRxDynamicLinker::cast(hsrxSysRegistry()->at(kHsRxDynamicLinker));
}

TEST(HsRxSysRegistry, holdsTheClassAndServiceDictionariesAndTheLinker) {
    ASSERT_NE(HsRxDictionary::cast(hsrxSysRegistry()->at(L"ClassDictionary")), nullptr);
    ASSERT_NE(HsRxDictionary::cast(hsrxSysRegistry()->at(L"ServiceDictionary")), nullptr);
    ASSERT_NE(linker(), nullptr);
    EXPECT_EQ(hsrxFindHsRxClass(L"HsRxService"), HsRxService::desc());
}

TEST(HsRxService, countsDependenciesDownToUnloadable) {
    HsRxService service;
    EXPECT_TRUE(service.unloadable());
    service.addDependency();
    service.addDependency();
    service.removeDependency();
    EXPECT_FALSE(service.unloadable()) << "one client is left";
    service.removeDependency();
    EXPECT_TRUE(service.unloadable());
    service.removeDependency();
    service.addDependency();
    EXPECT_FALSE(service.unloadable()) << "a stray release must not drive the count below zero";
}

TEST(HsRxDynamicLinker, registersServicesInTheServiceDictionary) {
    HsRxService service;
    HsRxService intruder;
    HsRxDictionary* services = HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));

    ASSERT_EQ(linker()->registerService(L"TestService", &service), Hsys::eSuccess);
    EXPECT_EQ(services->at(L"TestService"), &service);
    EXPECT_EQ(linker()->getService(L"TestService"), &service);
    EXPECT_EQ(linker()->registerService(L"TestService", &intruder), Hsys::eDuplicateName);
    EXPECT_EQ(linker()->getService(L"TestService"), &service);
    EXPECT_EQ(linker()->registerService(nullptr, &service), Hsys::eNullPointer);
    EXPECT_EQ(linker()->registerService(L"Other", nullptr), Hsys::eNullPointer);

    EXPECT_EQ(linker()->unregisterService(L"TestService"), &service);
    EXPECT_FALSE(services->has(L"TestService"));
    EXPECT_EQ(linker()->unregisterService(L"TestService"), nullptr);
}

TEST(HsRxDynamicLinker, aForeignObjectUnderAServiceNameIsNoService) {
    HsRxDictionary* services = HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
    HsRxDictionary notAService;
    services->atPut(L"Foreign", &notAService);
    EXPECT_EQ(linker()->getService(L"Foreign"), nullptr);
    services->remove(L"Foreign");
}

} // namespace
