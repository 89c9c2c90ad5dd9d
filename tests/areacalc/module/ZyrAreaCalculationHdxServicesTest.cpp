// The life of the module's service: made by the first client, shared by the next, gone with the
// last, and dead for the rest of the process. One scenario, since death cannot be undone.
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoardPtr.h"
#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"
#include "platform/base/app/ZyrDatabaseDataMgrDictionary.h"
#include "platform/base/app/ZyrUserMessages.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace {

using Services = ZyrAreaCalculationHdxServices;

HsRxDictionary& serviceDictionary() {
    return *HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
}

TEST(ZyrAreaCalculationHdxServices, livesFromTheFirstClientToTheLastAndStaysDead) {
    ZyrAreaCalculationTestModule::registerClasses();
    AFX_EXTENSION_MODULE extension;
    ZyrAppHdx second(L"Sibling80", nullptr, extension, L"Sibling");
    ZyrAppHdx& first = ZyrAreaCalculationTestModule::client();
    ZyrUserMessageCapture alerts;

    // Refusals leave everything as it was.
    EXPECT_EQ(Services::registerService(nullptr), Hsys::eDoesNotApply);
    HsRxService foreign;
    serviceDictionary().atPut(Services::mServiceName, &foreign);
    EXPECT_EQ(Services::registerService(&first), Hsys::eDoesNotApply) << "name taken by another";
    serviceDictionary().remove(Services::mServiceName);
    EXPECT_EQ(Services::service(), nullptr);

    // The first client makes the service, the second only adds itself.
    ASSERT_EQ(Services::registerService(&first), Hsys::eSuccess);
    Services* service = Services::service();
    ASSERT_NE(service, nullptr);
    EXPECT_EQ(serviceDictionary().at(Services::mServiceName), service);
    EXPECT_NE(ZyrDatabaseDataMgrDictionary::getMgr(ZyrAreaCalculationBaseApp::kAppName), nullptr);
    EXPECT_EQ(Services::registerService(&second), Hsys::eSuccess);
    EXPECT_EQ(Services::service(), service);
    EXPECT_EQ(service->dependencyCount(), 2);

    // A service whose entry was lost is not entered again.
    serviceDictionary().remove(Services::mServiceName);
    EXPECT_EQ(Services::registerService(&second), Hsys::eDoesNotApply);
    serviceDictionary().atPut(Services::mServiceName, service);
    EXPECT_EQ(service->dependencyCount(), 2);

    ZyrRmCString names[2];
    Services::getAreaHdxAppName(names[0]);
    Services::getAreaHdxModuleName(names[1]);
    EXPECT_EQ(names[0] + names[1], L"ZyrAreaCalculationBase80ZyrAreaCalculationBase80");

    Services::unRegisterService(nullptr);
    Services::unRegisterService(&second);
    EXPECT_EQ(Services::service(), service) << "one client remains";
    Services::unRegisterService(&first);

    // Dead, with all it made, for good.
    EXPECT_EQ(Services::service(), nullptr);
    EXPECT_FALSE(serviceDictionary().has(Services::mServiceName));
    EXPECT_EQ(ZyrDatabaseDataMgrDictionary::getMgr(ZyrAreaCalculationBaseApp::kAppName), nullptr);
    EXPECT_EQ(Services::registerService(&first), 6);
    EXPECT_EQ(Services::service(), nullptr);
    EXPECT_TRUE(alerts.entries().empty());

    // What needs the service does without it.
    std::vector<HsRxClass*> classes{nullptr};
    ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(classes);
    EXPECT_EQ(classes.size(), 1u);
    ZyrAreaCalculationWhiteBoard board;
    EXPECT_EQ(board.attachAlgorithm(ZyrAreaCalculationAreaAlgorithm::desc()), Hsys::eDoesNotApply);
    EXPECT_EQ(ZyrDatabaseDataZyrAreaCalculationBase::instance(nullptr), nullptr);
    ZyrAreaCalculationWhiteBoardPtr pointer;
    EXPECT_THROW(pointer->algorithmVector(), std::runtime_error);
}

} // namespace
