#include "platform/base/app/ZyrAppHdx.h"

#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrAppHdx, HsRxObject, 0, nullptr)

ZyrAppHdx::ZyrAppHdx(const wchar_t* appName, HsModuleHandle module, AFX_EXTENSION_MODULE& extension,
                     const wchar_t* moduleName)
    : m_appName(appName), m_moduleName(moduleName), m_module(module), m_extension(extension) {
    ZyrDecoratorManager::bindModule(m_module, m_appName.str());
}

ZyrAppHdx::~ZyrAppHdx() { ZyrDecoratorManager::unbindModule(m_module); }

Hsys::ErrorStatus ZyrAppHdx::initApp() { return Hsys::eSuccess; }
Hsys::ErrorStatus ZyrAppHdx::exitApp() { return Hsys::eSuccess; }
void ZyrAppHdx::getRequiredModules(ZyrRmCStringArray& /*modules*/) {}
ZyrRmCString ZyrAppHdx::getComponentName() const { return m_moduleName; }
Hsys::ErrorStatus ZyrAppHdx::registerServices() { return Hsys::eSuccess; }
Hsys::ErrorStatus ZyrAppHdx::unRegisterServices() { return Hsys::eSuccess; }
void ZyrAppHdx::registerViews() {}
void ZyrAppHdx::unRegisterViews() {}
void ZyrAppHdx::initBdf(void* /*packet*/) {}
void ZyrAppHdx::exitBdf(void* /*packet*/) {}
void ZyrAppHdx::saveBdf(void* /*packet*/) {}
void ZyrAppHdx::endBdf(void* /*packet*/) {}
void ZyrAppHdx::quitBdf(void* /*packet*/) {}

HsRx::AppRetCode ZyrAppHdx::entryPoint(HsRx::AppMsgCode message, void* packet) {
    switch (message) {
    case HsRx::kInitAppMsg: return start(packet);
    case HsRx::kUnloadAppMsg: return stop();
    case HsRx::kLoadBdfMsg: initBdf(packet); return HsRx::eOk;
    case HsRx::kUnloadBdfMsg: exitBdf(packet); return HsRx::eOk;
    case HsRx::kSaveMsg: saveBdf(packet); return HsRx::eOk;
    case HsRx::kEndMsg: endBdf(packet); return HsRx::eOk;
    case HsRx::kQuitMsg: quitBdf(packet); return HsRx::eOk;
    }
    return HsRx::eOk;
}

HsRx::AppRetCode ZyrAppHdx::start(void* packet) {
    if (m_running)
        return HsRx::eOk;
    m_hsysAppPtr = packet;
    ZyrDecoratorManager::registerClasses(m_module);
    if (registerServices() != Hsys::eSuccess) {
        // Leave no half-registered services behind: a module that cannot start is not loaded.
        unRegisterServices();
        return HsRx::eRetError;
    }
    registerViews();
    initApp();
    m_running = true;
    return HsRx::eOk;
}

HsRx::AppRetCode ZyrAppHdx::stop() {
    if (!m_running)
        return HsRx::eOk;
    exitApp();
    unRegisterViews();
    unRegisterServices();
    m_running = false;
    return HsRx::eOk;
}
