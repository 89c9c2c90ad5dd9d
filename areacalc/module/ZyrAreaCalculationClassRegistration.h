// The run-time class members of the module's classes that are not filed by a record of their own:
// rxInit registers the class, desc and isA answer its descriptor, cast checks the class, and a
// static decorator puts the class into the module's class table with its display texts.
#pragma once

#include "areacalc/module/ZyrAreaCalculationBaseModule.h"
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/host/rx/HsRxClass.h"

#include <typeinfo>

namespace ZyrAreaCalculationClassRegistration {

// With descriptor set, the class registered under the name must be that descriptor: it is
// returned, and another class under the name ends the process with "Class mismatch". Otherwise
// the class is registered with the short form of newHsRxClass and the result stored.
HsRxClass* rxInit(HsRxClass*& descriptor, const wchar_t* name, const HsRxClass* parent,
                  int proxyFlags, HsRxClass::PseudoConstructor constructor);
// The same with the long form, for a class filed under recordName (drawing version 23,
// maintenance version 3).
HsRxClass* rxInit(HsRxClass*& descriptor, const wchar_t* name, const HsRxClass* parent,
                  int proxyFlags, HsRxClass::PseudoConstructor constructor,
                  const wchar_t* recordName, const wchar_t* appDescription,
                  HsRxClass::AppDataCallback appDataCallback);
// The stored descriptor; while there is none, the class registered under the name, stored.
HsRxClass* desc(HsRxClass*& descriptor, const wchar_t* name);

// A parent of this module is registered through its own rxInit first, so that the order in which
// the decorators happen to be built does not matter; a parent of the host or the sibling modules
// registers itself when its descriptor is first asked for.
template <class Parent> HsRxClass* parentClass() {
    if constexpr (requires { Parent::rxInit(); })
        return Parent::rxInit();
    else
        return Parent::desc();
}

} // namespace ZyrAreaCalculationClassRegistration

#define ZYR_AREACALC_DECLARE_MEMBERS(CLASS)                                                        \
public:                                                                                            \
    static HsRxClass* rxInit();                                                                    \
    static HsRxClass* desc() {                                                                     \
        return gpDesc != nullptr ? gpDesc                                                          \
                                 : ZyrAreaCalculationClassRegistration::desc(gpDesc, L"" #CLASS);  \
    }                                                                                              \
    HsRxClass* isA() const override;                                                               \
    static CLASS* cast(const HsRxObject* object) {                                                 \
        return object != nullptr && object->isKindOf(desc())                                       \
                   ? static_cast<CLASS*>(const_cast<HsRxObject*>(object))                          \
                   : nullptr;                                                                      \
    }                                                                                              \
                                                                                                   \
private:                                                                                           \
    static HsRxClass* gpDesc;                                                                      \
                                                                                                   \
public:

// What every class of the module defines after its rxInit: isA through the cached descriptor, and
// the decorator that registers the class with the module.
#define ZYR_AREACALC_DEFINE_ISA_AND_DECORATOR(CLASS, PARENT, NAME_ID, SECOND_ID)                   \
    HsRxClass* CLASS::isA() const {                                                                \
        return CLASS::desc();                                                                      \
    }                                                                                              \
    ZyrRxClassDecorator gZyrDecorator##CLASS(typeid(CLASS), typeid(PARENT), &CLASS::rxInit,        \
                                             &CLASS::desc, &_hdllInstance, NAME_ID, SECOND_ID);

// FLAGS are the proxy flags, CONSTRUCTOR the pseudo constructor or nullptr; NAME_ID and SECOND_ID
// are the decorator's text ids, ZyrRxClassDecorator::kNoText for none.
#define ZYR_AREACALC_DEFINE_MEMBERS(CLASS, PARENT, FLAGS, CONSTRUCTOR, NAME_ID, SECOND_ID)         \
    HsRxClass* CLASS::gpDesc = nullptr;                                                            \
    HsRxClass* CLASS::rxInit() {                                                                   \
        return ZyrAreaCalculationClassRegistration::rxInit(                                        \
            gpDesc, L"" #CLASS, ZyrAreaCalculationClassRegistration::parentClass<PARENT>(), FLAGS, \
            CONSTRUCTOR);                                                                          \
    }                                                                                              \
    ZYR_AREACALC_DEFINE_ISA_AND_DECORATOR(CLASS, PARENT, NAME_ID, SECOND_ID)
