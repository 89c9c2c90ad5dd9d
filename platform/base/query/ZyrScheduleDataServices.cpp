#include "platform/base/query/ZyrScheduleDataServices.h"

#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"

HSRX_DEFINE_MEMBERS(ZyrScheduleDataServices, HsRxService, 0, nullptr)

ZyrScheduleDataServices* ZyrScheduleDataServices::service() {
    const auto* services = HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxServiceDictionary));
    return services != nullptr ? cast(services->at(kServiceName)) : nullptr;
}
