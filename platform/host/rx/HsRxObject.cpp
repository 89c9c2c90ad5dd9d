#include "platform/host/rx/HsRxObject.h"

#include "platform/host/rx/HsRxClass.h"

HsRxObject::~HsRxObject() = default;

HsRxClass* HsRxObject::desc() {
    static HsRxClass* const descriptor = hsrxFindHsRxClass(L"HsRxObject");
    return descriptor;
}

HsRxClass* HsRxObject::isA() const {
    return HsRxObject::desc();
}

HsRxObject* HsRxObject::clone() const {
    HsRxObject* copy = isA()->create();
    if (copy == nullptr)
        return nullptr;
    if (copy->copyFrom(this) != Hsys::eSuccess) {
        delete copy;
        return nullptr;
    }
    return copy;
}

Hsys::ErrorStatus HsRxObject::copyFrom(const HsRxObject* /*other*/) {
    return Hsys::eNotImplemented;
}

bool HsRxObject::isEqualTo(const HsRxObject* other) const {
    return other == this;
}

HsRx::Ordering HsRxObject::comparedTo(const HsRxObject* /*other*/) const {
    return HsRx::eNotOrderable;
}

HsRxObject* HsRxObject::subQueryX(const HsRxClass* protocolClass) const {
    return isKindOf(protocolClass) ? const_cast<HsRxObject*>(this) : nullptr;
}

bool HsRxObject::isDerivedFrom(const HsRxClass* own, const HsRxClass* cls) {
    return own->isDerivedFrom(cls);
}

HsRxClass* hsrxRegisterOnce(const wchar_t* name, HsRxClass* parent, int proxyFlags,
                            HsRxObject* (*constructor)()) {
    if (HsRxClass* known = hsrxFindHsRxClass(name))
        return known;
    return newHsRxClass(name, parent->name(), proxyFlags, constructor);
}
