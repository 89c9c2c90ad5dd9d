// Component specifications of the module: the property sets of an area (a group) may lie on the
// object itself and on its style.
#pragma once

#include "platform/base/query/ZyrCompSpec.h"
#include "platform/host/rx/HsRxClass.h"

// Object is the drawing object class, Style its style class. Each instance is registered under a
// name of its own (kClassName), below "ZyrCompSpec", and made by a factory function of its own
// (kFactory); both are given where the instance is defined.
template <class Object, class Style> class ZyrCompSpecTemplate : public ZyrCompSpec {
public:
    static const wchar_t* const kClassName;
    static const HsRxClass::PseudoConstructor kFactory;

    // Registers the instance's class, as every class of the module ("Class mismatch" included).
    static HsRxClass* rxInit();
    // The class registered under kClassName, looked up in the class dictionary on every call.
    static HsRxClass* desc() { return hsrxFindHsRxClass(kClassName); }
    HsRxClass* isA() const override { return desc(); }

    HsRxClass* worksWith() const override { return Object::desc(); }
    void extendedClasses(HsArray<void*>& classes) const override { classes.append(Style::desc()); }
    // The base's location (the object), then the object's style when the object is an Object.
    // The first failure, or eSuccess.
    Hsys::ErrorStatus propSetLocations(HsDbObject* object, HsArray<HsDbObjectId>& ids,
                                       ZyrRmCStringArray& names) override {
        const Hsys::ErrorStatus status = ZyrCompSpec::propSetLocations(object, ids, names);
        const Object* typed = Object::cast(object);
        if (typed == nullptr)
            return status;
        const Hsys::ErrorStatus styleStatus = addLocation(typed->styleId(), ids, names);
        return status != Hsys::eSuccess ? status : styleStatus;
    }

private:
    static HsRxClass* gpDesc;
};

class ZyrDbArea;
class ZyrDbAreaStyle;

using ZyrCompSpecArea = ZyrCompSpecTemplate<ZyrDbArea, ZyrDbAreaStyle>;
template <> const wchar_t* const ZyrCompSpecArea::kClassName;
template <> const HsRxClass::PseudoConstructor ZyrCompSpecArea::kFactory;
extern template class ZyrCompSpecTemplate<ZyrDbArea, ZyrDbAreaStyle>;

// A new component description of areas, owned by the caller.
HsRxObject* makeZyrCompSpecArea();

class ZyrDbAreaGroup;
class ZyrDbAreaGroupStyle;

using ZyrCompSpecAreaGroup = ZyrCompSpecTemplate<ZyrDbAreaGroup, ZyrDbAreaGroupStyle>;
template <> const wchar_t* const ZyrCompSpecAreaGroup::kClassName;
template <> const HsRxClass::PseudoConstructor ZyrCompSpecAreaGroup::kFactory;
extern template class ZyrCompSpecTemplate<ZyrDbAreaGroup, ZyrDbAreaGroupStyle>;

// A new component description of area groups, owned by the caller.
HsRxObject* makeZyrCompSpecAreaGroup();
