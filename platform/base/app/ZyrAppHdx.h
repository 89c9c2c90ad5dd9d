// The application frame of a module: the host's messages come in through entryPoint, which brings
// the module's class table, services and application up, and takes them down again at unload.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/rx/HsRxApplication.h"
#include "platform/host/rx/HsRxObject.h"
#include "platform/host/ut/HsModuleHandle.h"

class ZyrAppHdx : public HsRxObject {
    HSRX_DECLARE_MEMBERS(ZyrAppHdx)

public:
    // appName names the module's texts and settings ("...80"); moduleName is the short name of
    // the image. The extension record is the module's own and outlives the application.
    ZyrAppHdx(const wchar_t* appName, HsModuleHandle module, AFX_EXTENSION_MODULE& extension,
              const wchar_t* moduleName);
    ~ZyrAppHdx() override;

    // The virtual operations a module overrides, in the order of their slots.
    virtual Hsys::ErrorStatus initApp();
    virtual Hsys::ErrorStatus exitApp();
    virtual void getRequiredModules(ZyrRmCStringArray& modules);
    virtual ZyrRmCString getComponentName() const;
    virtual Hsys::ErrorStatus registerServices();
    virtual Hsys::ErrorStatus unRegisterServices();
    virtual void registerViews();
    virtual void unRegisterViews();
    // Per-drawing events of the host; a module that reacts to none keeps these.
    virtual void initBdf(void* packet);
    virtual void exitBdf(void* packet);
    virtual void saveBdf(void* packet);
    virtual void endBdf(void* packet);
    virtual void quitBdf(void* packet);

    // Init: classes (through the module's decorators), services, views, then initApp. A failed
    // service registration answers eRetError and the application is not started. Unload: exitApp,
    // views, then services. Classes stay registered while the image is loaded: objects and cached
    // descriptors of them may outlive the application.
    HsRx::AppRetCode entryPoint(HsRx::AppMsgCode message, void* packet);

    const ZyrRmCString& appName() const { return m_appName; }
    const ZyrRmCString& moduleName() const { return m_moduleName; }
    HsModuleHandle module() const { return m_module; }
    // The module's extension record, as the loader filled it at attach.
    const AFX_EXTENSION_MODULE& extension() const { return m_extension; }
    // The host's pointer for this application, known from the init message on.
    void* hsysAppPtr() const { return m_hsysAppPtr; }
    bool isRunning() const { return m_running; }

private:
    HsRx::AppRetCode start(void* packet);
    HsRx::AppRetCode stop();

    ZyrRmCString m_appName;
    ZyrRmCString m_moduleName;
    HsModuleHandle m_module;
    AFX_EXTENSION_MODULE& m_extension;
    void* m_hsysAppPtr = nullptr;
    bool m_running = false;
};
