// Brings the module up in a test program as the application frame does: its texts and classes
// registered, and its service registered by one client module and kept for the whole program.
#pragma once

#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/module/ZyrAreaCalculationBaseModule.h"
#include "areacalc/module/ZyrAreaCalculationBaseTexts.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/base/app/ZyrAppHdx.h"
#include "platform/base/app/ZyrRxClassDecorator.h"

struct ZyrAreaCalculationTestModule {
    // The client module; its construction ties the module's image to the module's texts.
    static ZyrAppHdx& client() {
        static AFX_EXTENSION_MODULE extension;
        static ZyrAppHdx app(ZyrAreaCalculationBaseApp::kAppName, _hdllInstance, extension,
                             L"ZyrAreaCalculationBase");
        return app;
    }
    static void registerClasses() {
        client();
        ZyrAreaCalculationBaseTexts::registerTexts();
        ZyrDecoratorManager::registerClasses(_hdllInstance);
    }
    static ZyrAreaCalculationHdxServices& services() {
        registerClasses();
        if (ZyrAreaCalculationHdxServices::service() == nullptr)
            (void)ZyrAreaCalculationHdxServices::registerService(&client());
        return *ZyrAreaCalculationHdxServices::service();
    }
};
