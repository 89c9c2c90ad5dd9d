// The host's linker: it enters services in the service dictionary.
#pragma once

#include "platform/host/rx/HsRxObject.h"

class HsRxService;

class HsRxDynamicLinker : public HsRxObject {
    HSRX_DECLARE_MEMBERS(HsRxDynamicLinker)

public:
    // Enters a service under a name. eNullPointer for a null name or service; eDuplicateName when
    // the name is taken (the present entry stays).
    Hsys::ErrorStatus registerService(const wchar_t* serviceName, HsRxService* service);
    // Takes the service out of the dictionary and returns it, or null.
    HsRxService* unregisterService(const wchar_t* serviceName);
    // The service under a name, or null when there is none or the entry is not a service.
    HsRxService* getService(const wchar_t* serviceName) const;
};
