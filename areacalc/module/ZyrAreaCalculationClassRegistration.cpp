#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"

namespace ZyrAreaCalculationClassRegistration {

namespace {

// True when the descriptor is the class registered under the name; another class under the name
// ends the process.
bool isRegistered(const HsRxClass* descriptor, const wchar_t* name) {
    if (descriptor == nullptr)
        return false;
    const HsRxClass* registered = hsrxFindHsRxClass(name);
    if (registered != nullptr && registered != descriptor)
        hsrx_abort(L"Class mismatch");
    return registered == descriptor;
}

const wchar_t* nameOf(const HsRxClass* parent) {
    return parent != nullptr ? parent->name() : nullptr;
}

} // namespace

HsRxClass* rxInit(HsRxClass*& descriptor, const wchar_t* name, const HsRxClass* parent,
                  int proxyFlags, HsRxClass::PseudoConstructor constructor) {
    if (!isRegistered(descriptor, name))
        descriptor = newHsRxClass(name, nameOf(parent), proxyFlags, constructor);
    return descriptor;
}

HsRxClass* rxInit(HsRxClass*& descriptor, const wchar_t* name, const HsRxClass* parent,
                  int proxyFlags, HsRxClass::PseudoConstructor constructor,
                  const wchar_t* recordName, const wchar_t* appDescription,
                  HsRxClass::AppDataCallback appDataCallback) {
    // The drawing and maintenance versions of every filed class of the module.
    constexpr int kDrawingVersion = 23;
    constexpr int kMaintenanceVersion = 3;
    if (!isRegistered(descriptor, name))
        descriptor =
            newHsRxClass(name, nameOf(parent), kDrawingVersion, kMaintenanceVersion, proxyFlags,
                         constructor, recordName, appDescription, appDataCallback);
    return descriptor;
}

HsRxClass* desc(HsRxClass*& descriptor, const wchar_t* name) {
    if (descriptor == nullptr)
        descriptor = hsrxFindHsRxClass(name);
    return descriptor;
}

} // namespace ZyrAreaCalculationClassRegistration
