#include "platform/host/rx/HsRxApplication.h"

#include <set>

namespace {
std::set<const void*>& mdiAwareApps() {
    static std::set<const void*> apps;
    return apps;
}
} // namespace

void hsrxRegisterAppMDIAware(void* appPtr) {
    if (appPtr != nullptr)
        mdiAwareApps().insert(appPtr);
}

bool hsrxIsAppMDIAware(const void* appPtr) { return mdiAwareApps().count(appPtr) != 0; }

void hsrxUnregisterAppMDIAware(void* appPtr) { mdiAwareApps().erase(appPtr); }
