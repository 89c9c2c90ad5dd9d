#include "platform/host/rx/HsRxClass.h"

#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "platform/host/ut/HsutFormat.h"
#include "platform/host/ut/HsutUtf8.h"

#include <cstdarg>
#include <cstdio>
#include <cstdlib>

HSRX_DEFINE_MEMBERS(HsRxClass, HsRxObject, 0, nullptr)

HsRxClass::HsRxClass(Registration registration) : m_reg(std::move(registration)) {}

bool HsRxClass::isDerivedFrom(const HsRxClass* other) const {
    for (const HsRxClass* cls = this; cls != nullptr; cls = cls->myParent())
        if (cls == other)
            return true;
    return false;
}

HsRx::Ordering HsRxClass::comparedTo(const HsRxObject* other) const {
    const HsRxClass* cls = HsRxClass::cast(other);
    if (cls == nullptr)
        return HsRx::eNotOrderable;
    if (cls == this)
        return HsRx::eEqual;
    return m_reg.name < cls->m_reg.name ? HsRx::eLessThan : HsRx::eGreaterThan;
}

HsRxObject* HsRxClass::create() const {
    return m_reg.constructor != nullptr ? m_reg.constructor() : nullptr;
}

namespace {

// The registry's own entries are known for what they are; casting them would ask for descriptors
// while the descriptors are being registered.
HsRxDictionary* classDictionary() {
    return static_cast<HsRxDictionary*>(hsrxSysRegistry()->at(kHsRxClassDictionary));
}

HsRxClass* registerClass(HsRxClass::Registration registration) {
    if (registration.name.empty() || hsrxFindHsRxClass(registration.name.c_str()) != nullptr)
        return nullptr;
    auto* cls = new HsRxClass(std::move(registration));
    classDictionary()->atPut(cls->name(), cls);
    return cls;
}

std::wstring orEmpty(const wchar_t* text) { return text != nullptr ? text : L""; }

} // namespace

HsRxClass* newHsRxClass(const wchar_t* className, const wchar_t* parentClassName, int drawingVersion,
                        int maintenanceVersion, int proxyFlags,
                        HsRxClass::PseudoConstructor constructor, const wchar_t* recordName,
                        const wchar_t* appDescription, HsRxClass::AppDataCallback appDataCallback) {
    HsRxClass* parent = parentClassName != nullptr ? hsrxFindHsRxClass(parentClassName) : nullptr;
    if (parent == nullptr)
        return nullptr;
    return registerClass({orEmpty(className), parent, drawingVersion, maintenanceVersion, proxyFlags,
                          constructor, orEmpty(recordName), orEmpty(appDescription), appDataCallback});
}

HsRxClass* newHsRxClass(const wchar_t* className, const wchar_t* parentClassName, int proxyFlags,
                        HsRxClass::PseudoConstructor constructor, const wchar_t* recordName,
                        const wchar_t* appDescription) {
    return newHsRxClass(className, parentClassName, 0, 0, proxyFlags, constructor, recordName,
                        appDescription, nullptr);
}

void deleteHsRxClass(HsRxClass* cls) {
    if (cls == nullptr)
        return;
    if (classDictionary()->at(cls->name()) == cls)
        classDictionary()->remove(cls->name());
    delete cls;
}

HsRxClass* hsrxFindHsRxClass(const wchar_t* className) {
    if (className == nullptr)
        return nullptr;
    return static_cast<HsRxClass*>(classDictionary()->at(className));
}

void hsrx_abort(const wchar_t* format, ...) {
    va_list args;
    va_start(args, format);
    const std::string text = hsutToUtf8(hsutVFormat(format, args));
    va_end(args);
    std::fprintf(stderr, "hsrx_abort: %s\n", text.c_str());
    std::fflush(stderr);
    std::abort();
}
