#include "platform/host/rx/HsRxSysRegistry.h"

#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxDynamicLinker.h"

namespace {

// The root class cannot register itself through newHsRxClass: it has no parent to name.
HsRxDictionary* makeClassDictionary() {
    auto* classes = new HsRxDictionary;
    HsRxClass::Registration root;
    root.name = L"HsRxObject";
    classes->atPut(L"HsRxObject", new HsRxClass(std::move(root)));
    return classes;
}

HsRxDictionary* makeSysRegistry() {
    auto* registry = new HsRxDictionary;
    registry->atPut(kHsRxClassDictionary, makeClassDictionary());
    registry->atPut(kHsRxServiceDictionary, new HsRxDictionary);
    registry->atPut(kHsRxDynamicLinker, new HsRxDynamicLinker);
    return registry;
}

} // namespace

HsRxDictionary* hsrxSysRegistry() {
    // Lives for the whole process and is never destroyed: module exit code still reaches it while
    // static objects are being torn down.
    static HsRxDictionary* const registry = makeSysRegistry();
    return registry;
}
