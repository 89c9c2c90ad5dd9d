// The module's service: through it every part of the module, and every other module that knows
// the class, reaches the white board, the factories, the base service and the per-database data.
// Nothing is built before it is first asked for, and everything built dies with the service.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/rx/HsRxService.h"

class ZyrAppHdx;
class ZyrAreaCalculationBaseService;
class ZyrAreaCalculationBaseSingletonFactory;
class ZyrAreaCalculationWhiteBoard;
class ZyrDatabaseDataMgr;
class ZyrPrimitiveExpressionHandlerFactory;

class ZyrAreaCalculationHdxServices : public HsRxService {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrAreaCalculationHdxServices)

public:
    ~ZyrAreaCalculationHdxServices() override;
    ZyrAreaCalculationHdxServices(const ZyrAreaCalculationHdxServices&) = delete;
    ZyrAreaCalculationHdxServices& operator=(const ZyrAreaCalculationHdxServices&) = delete;

    // The service, or null before the first registration and for good once it has died. Nobody
    // keeps this pointer, or anything it hands out, across calls.
    static ZyrAreaCalculationHdxServices* service();
    // Called by every module that uses the service: the first creates it and enters it in the
    // service dictionary, each adds a dependency. 6 once the service has died; eDoesNotApply for a
    // null application, a missing dictionary, or a dictionary that disagrees with the service
    // (its name taken by a foreign object, or the service's entry lost).
    static Hsys::ErrorStatus registerService(ZyrAppHdx* app);
    // Removes the dependency; the last one takes the service out of the dictionary and deletes it.
    static void unRegisterService(ZyrAppHdx* app);
    static void getAreaHdxAppName(ZyrRmCString& name);
    static void getAreaHdxModuleName(ZyrRmCString& name);

    ZyrAreaCalculationWhiteBoard* whiteBoard();
    // Empty at first: a decompositor comes in when its class is first asked for.
    ZyrAreaCalculationBaseSingletonFactory* decompositorFactory();
    // Holds the area and the perimeter algorithm from the start.
    ZyrAreaCalculationBaseSingletonFactory* algorithmFactory();
    // The formula patterns of decomposed pieces belong to the area algorithm; null when it has
    // none.
    ZyrPrimitiveExpressionHandlerFactory* expressionHandlerFactory();
    // A base service entered in the service dictionary wins on every call; otherwise a plain one
    // made on the first need.
    ZyrAreaCalculationBaseService* baseService();
    // The manager of the module's per-database packets, or null.
    ZyrDatabaseDataMgr* databaseDataManager();

    // The key in the service dictionary.
    static constexpr const wchar_t* mServiceName = L"ZyrAreaCalculationHdxServices";

private:
    ZyrAreaCalculationHdxServices();
    // The name under which the module's texts and per-database packets are registered.
    static const wchar_t* appName();

    static ZyrAreaCalculationHdxServices* mThis;
    static bool mHasShutDownAlready;

    ZyrAreaCalculationBaseSingletonFactory* m_decompositorFactory = nullptr;
    ZyrAreaCalculationBaseSingletonFactory* m_algorithmFactory = nullptr;
    ZyrAreaCalculationBaseService* m_fallbackBaseService = nullptr;
    ZyrAreaCalculationWhiteBoard* m_whiteBoard = nullptr;
};
