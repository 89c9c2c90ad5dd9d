#include "platform/host/rx/HsRxDynamicLinker.h"

#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxService.h"
#include "platform/host/rx/HsRxSysRegistry.h"

HSRX_DEFINE_MEMBERS(HsRxDynamicLinker, HsRxObject, 0, nullptr)

namespace {
HsRxDictionary* serviceDictionary() {
    return static_cast<HsRxDictionary*>(hsrxSysRegistry()->at(kHsRxServiceDictionary));
}
} // namespace

Hsys::ErrorStatus HsRxDynamicLinker::registerService(const wchar_t* serviceName, HsRxService* service) {
    if (serviceName == nullptr || service == nullptr)
        return Hsys::eNullPointer;
    HsRxDictionary* services = serviceDictionary();
    if (services->has(serviceName))
        return Hsys::eDuplicateName;
    services->atPut(serviceName, service);
    return Hsys::eSuccess;
}

HsRxService* HsRxDynamicLinker::unregisterService(const wchar_t* serviceName) {
    return HsRxService::cast(serviceDictionary()->remove(serviceName));
}

HsRxService* HsRxDynamicLinker::getService(const wchar_t* serviceName) const {
    return HsRxService::cast(serviceDictionary()->at(serviceName));
}
