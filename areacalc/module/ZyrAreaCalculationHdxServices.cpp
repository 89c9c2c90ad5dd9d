#include "areacalc/module/ZyrAreaCalculationHdxServices.h"

#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/module/ZyrAreaCalculationBaseSingletonFactory.h"
#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"
#include "platform/base/app/ZyrDatabaseDataMgrDictionary.h"
#include "platform/base/app/ZyrUserMessages.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxDynamicLinker.h"
#include "platform/host/rx/HsRxSysRegistry.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrAreaCalculationHdxServices, HsRxService, 0, nullptr,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)

ZyrAreaCalculationHdxServices* ZyrAreaCalculationHdxServices::mThis = nullptr;
bool ZyrAreaCalculationHdxServices::mHasShutDownAlready = false;

namespace {

// The registry's service dictionary, or null.
HsRxDictionary* serviceDictionary() {
    return HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
}

// Both tell the user and go on: the service lives without per-database data.
void alertUnlessSuccess(Hsys::ErrorStatus status) {
    if (status != Hsys::eSuccess)
        Zyr::rxErrorAlert(status);
}

} // namespace

const wchar_t* ZyrAreaCalculationHdxServices::appName() {
    return ZyrAreaCalculationBaseApp::kAppName;
}

ZyrAreaCalculationHdxServices::ZyrAreaCalculationHdxServices() {
    alertUnlessSuccess(ZyrDatabaseDataMgrDictionary::registerPacketType(
        appName(), ZyrDatabaseDataZyrAreaCalculationBase::desc()));
}

ZyrAreaCalculationHdxServices::~ZyrAreaCalculationHdxServices() {
    alertUnlessSuccess(ZyrDatabaseDataMgrDictionary::unRegisterPacketType(appName()));
    delete m_decompositorFactory;
    delete m_algorithmFactory;
    delete m_fallbackBaseService;
    delete m_whiteBoard;
    mHasShutDownAlready = true;
}

ZyrAreaCalculationHdxServices* ZyrAreaCalculationHdxServices::service() {
    return mHasShutDownAlready ? nullptr : mThis;
}

Hsys::ErrorStatus ZyrAreaCalculationHdxServices::registerService(ZyrAppHdx* app) {
    if (mHasShutDownAlready)
        return Hsys::eOutOfMemory;
    if (app == nullptr)
        return Hsys::eDoesNotApply;
    HsRxDictionary* services = serviceDictionary();
    if (services == nullptr)
        return Hsys::eDoesNotApply;
    const bool entered = services->has(mServiceName);
    if (entered != (mThis != nullptr))
        return Hsys::eDoesNotApply;
    if (mThis == nullptr) {
        mThis = new ZyrAreaCalculationHdxServices;
        // The name is known to be free: the dictionary was asked above.
        if (auto* linker = HsRxDynamicLinker::cast(hsrxSysRegistry()->at(kHsRxDynamicLinker)))
            (void)linker->registerService(mServiceName, mThis);
    }
    mThis->addDependency();
    return Hsys::eSuccess;
}

void ZyrAreaCalculationHdxServices::unRegisterService(ZyrAppHdx* app) {
    if (mHasShutDownAlready || app == nullptr || mThis == nullptr)
        return;
    mThis->removeDependency();
    if (!mThis->unloadable())
        return;
    // The dictionary does not own its entries: the service is deleted here, not through it.
    if (HsRxDictionary* services = serviceDictionary())
        services->remove(mServiceName);
    delete mThis;
    mThis = nullptr;
}

void ZyrAreaCalculationHdxServices::getAreaHdxAppName(ZyrRmCString& name) {
    name = appName();
}

void ZyrAreaCalculationHdxServices::getAreaHdxModuleName(ZyrRmCString& name) {
    name = appName();
}

ZyrAreaCalculationWhiteBoard* ZyrAreaCalculationHdxServices::whiteBoard() {
    if (m_whiteBoard == nullptr)
        m_whiteBoard = new ZyrAreaCalculationWhiteBoard;
    return m_whiteBoard;
}

ZyrAreaCalculationBaseSingletonFactory* ZyrAreaCalculationHdxServices::decompositorFactory() {
    if (m_decompositorFactory == nullptr)
        m_decompositorFactory = new ZyrAreaCalculationBaseSingletonFactory;
    return m_decompositorFactory;
}

ZyrAreaCalculationBaseSingletonFactory* ZyrAreaCalculationHdxServices::algorithmFactory() {
    if (m_algorithmFactory == nullptr) {
        m_algorithmFactory = new ZyrAreaCalculationBaseSingletonFactory;
        m_algorithmFactory->instance(ZyrAreaCalculationAreaAlgorithm::desc());
        m_algorithmFactory->instance(ZyrAreaCalculationPerimeterAlgorithm::desc());
    }
    return m_algorithmFactory;
}

ZyrPrimitiveExpressionHandlerFactory* ZyrAreaCalculationHdxServices::expressionHandlerFactory() {
    ZyrAreaCalculationBaseSingletonFactory* factory = algorithmFactory();
    if (factory == nullptr)
        return nullptr;
    const auto* area = ZyrAreaCalculationAreaAlgorithm::cast(
        factory->instance(ZyrAreaCalculationAreaAlgorithm::desc()));
    return area != nullptr ? area->expressionHandlerFactory() : nullptr;
}

ZyrAreaCalculationBaseService* ZyrAreaCalculationHdxServices::baseService() {
    HsRxDictionary* services = serviceDictionary();
    const wchar_t* key = ZyrAreaCalculationBaseService::serviceName();
    if (services != nullptr && services->has(key)) {
        if (auto* registered = ZyrAreaCalculationBaseService::cast(services->at(key)))
            return registered;
    }
    if (m_fallbackBaseService == nullptr)
        m_fallbackBaseService = new ZyrAreaCalculationBaseService;
    return m_fallbackBaseService;
}

ZyrDatabaseDataMgr* ZyrAreaCalculationHdxServices::databaseDataManager() {
    return ZyrDatabaseDataMgrDictionary::getMgr(appName());
}
