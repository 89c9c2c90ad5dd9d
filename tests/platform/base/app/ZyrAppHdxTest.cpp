// The application frame: a module brought up and down through the host's messages, and the base
// service's client count.
#include "platform/base/app/ZyrAppHdx.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

std::vector<std::string> gCalls;
HsModuleHandle gModule = nullptr;
AFX_EXTENSION_MODULE gExtension;

class Widget : public HsRxObject {};
HsRxClass* widgetDesc() {
    return hsrxFindHsRxClass(L"FrameWidget");
}
HsRxClass* widgetInit() {
    gCalls.push_back("rxInit");
    return widgetDesc() ? widgetDesc() : newHsRxClass(L"FrameWidget", L"HsRxObject", 0);
}
ZyrRxClassDecorator gWidgetDecorator(typeid(Widget), typeid(HsRxObject), widgetInit, widgetDesc,
                                     &gModule, -1, -1);

// Logs every step the frame takes; its services may fail.
class TestApp : public ZyrAppHdx {
public:
    explicit TestApp(HsModuleHandle module)
        : ZyrAppHdx(L"TestApp80", module, gExtension, L"TestApp") {}
    Hsys::ErrorStatus servicesStatus = Hsys::eSuccess;

    Hsys::ErrorStatus initApp() override { return log("initApp"); }
    Hsys::ErrorStatus exitApp() override { return log("exitApp"); }
    Hsys::ErrorStatus registerServices() override {
        return log("registerServices", servicesStatus);
    }
    Hsys::ErrorStatus unRegisterServices() override { return log("unRegisterServices"); }
    void registerViews() override { log("registerViews"); }
    void unRegisterViews() override { log("unRegisterViews"); }
    void initBdf(void*) override { log("initBdf"); }

private:
    static Hsys::ErrorStatus log(const char* call, Hsys::ErrorStatus status = Hsys::eSuccess) {
        gCalls.push_back(call);
        return status;
    }
};

int gHandleValue = 0;
int gHostApp = 0;

TEST(ZyrAppHdx, entryPointBringsTheModuleUpAndDownInOrder) {
    gModule = &gHandleValue;
    gCalls.clear();
    TestApp app(gModule);
    EXPECT_EQ(app.entryPoint(HsRx::kInitAppMsg, &gHostApp), HsRx::eOk);
    EXPECT_EQ(app.hsysAppPtr(), &gHostApp);
    EXPECT_TRUE(app.isRunning());
    EXPECT_NE(widgetDesc(), nullptr);
    EXPECT_EQ(app.entryPoint(HsRx::kInitAppMsg, &gHostApp), HsRx::eOk)
        << "a second init is ignored";
    app.entryPoint(HsRx::kLoadBdfMsg, nullptr);
    EXPECT_EQ(app.entryPoint(HsRx::kUnloadAppMsg, nullptr), HsRx::eOk);
    EXPECT_EQ(app.entryPoint(HsRx::kUnloadAppMsg, nullptr), HsRx::eOk)
        << "a second unload is ignored";

    const std::vector<std::string> expected{"rxInit",          "registerServices",  "registerViews",
                                            "initApp",         "initBdf",           "exitApp",
                                            "unRegisterViews", "unRegisterServices"};
    EXPECT_EQ(gCalls, expected);
    EXPECT_EQ(widgetDesc(), hsrxFindHsRxClass(L"FrameWidget")) << "classes outlive the application";
}

TEST(ZyrAppHdx, aModuleWhoseServicesFailDoesNotStart) {
    gModule = &gHandleValue;
    gCalls.clear();
    TestApp app(gModule);
    app.servicesStatus = Hsys::eDuplicateName;
    EXPECT_EQ(app.entryPoint(HsRx::kInitAppMsg, &gHostApp), HsRx::eRetError);
    EXPECT_FALSE(app.isRunning());
    const std::vector<std::string> expected{"rxInit", "registerServices", "unRegisterServices"};
    EXPECT_EQ(gCalls, expected);
}

TEST(ZyrBaseServices, livesWhileAnyClientModuleIsRegistered) {
    int handles[2] = {};
    TestApp first(&handles[0]);
    TestApp second(&handles[1]);
    HsRxDictionary* services = HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));

    ASSERT_EQ(ZyrBaseServices::service(), nullptr);
    EXPECT_EQ(ZyrBaseServices::unRegisterService(&first), Hsys::eDoesNotApply);
    ASSERT_EQ(ZyrBaseServices::registerService(&first), Hsys::eSuccess);
    ZyrBaseServices* service = ZyrBaseServices::service();
    ASSERT_NE(service, nullptr);
    EXPECT_EQ(services->at(L"ZyrBaseServices"), service);
    ASSERT_EQ(ZyrBaseServices::registerService(&second), Hsys::eSuccess);
    EXPECT_EQ(ZyrBaseServices::service(), service) << "a second client creates nothing";
    EXPECT_EQ(ZyrBaseServices::registerService(nullptr), Hsys::eNullPointer);

    EXPECT_EQ(ZyrBaseServices::unRegisterService(&first), Hsys::eSuccess);
    EXPECT_EQ(ZyrBaseServices::service(), service);
    EXPECT_EQ(ZyrBaseServices::unRegisterService(&second), Hsys::eSuccess);
    EXPECT_EQ(ZyrBaseServices::service(), nullptr);
    EXPECT_FALSE(services->has(L"ZyrBaseServices"));
    EXPECT_EQ(ZyrBaseServices::registerService(&first), Hsys::eSuccess) << "it can come back";
    EXPECT_EQ(ZyrBaseServices::unRegisterService(&first), Hsys::eSuccess);
}

} // namespace
