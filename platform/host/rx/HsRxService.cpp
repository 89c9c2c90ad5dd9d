#include "platform/host/rx/HsRxService.h"

#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(HsRxService, HsRxObject, 0, hsrxInstantiateClass<HsRxService>)
