// The root of the host's run-time class system: every object whose class the host knows.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

class HsRxClass;

namespace HsRx {
enum Ordering { eLessThan = -1, eEqual = 0, eGreaterThan = 1, eNotOrderable = 2 };
}

// Declares the run-time class members of a host or sibling class. The class's identity is its
// descriptor; cast() answers null for null and for an object of an unrelated class.
#define HSRX_DECLARE_MEMBERS(CLASS)                                                                \
public:                                                                                            \
    static HsRxClass* desc();                                                                      \
    HsRxClass* isA() const override;                                                               \
    static CLASS* cast(const HsRxObject* object) {                                                 \
        return object != nullptr && object->isKindOf(desc())                                       \
                   ? static_cast<CLASS*>(const_cast<HsRxObject*>(object))                          \
                   : nullptr;                                                                      \
    }

// Defines them: the descriptor is registered under the class's own name, after its parent, when
// the library is loaded, so that a drawing read before any object of the class was made finds the
// class by name. CONSTRUCTOR is a pseudo constructor or nullptr for an abstract class.
#define HSRX_DEFINE_MEMBERS(CLASS, PARENT, PROXY_FLAGS, CONSTRUCTOR)                               \
    HsRxClass* CLASS::desc() {                                                                     \
        static HsRxClass* const descriptor =                                                       \
            hsrxRegisterOnce(L"" #CLASS, PARENT::desc(), PROXY_FLAGS, CONSTRUCTOR);                \
        return descriptor;                                                                         \
    }                                                                                              \
    HsRxClass* CLASS::isA() const {                                                                \
        return CLASS::desc();                                                                      \
    }                                                                                              \
    [[maybe_unused]] static HsRxClass* const gHsRxRegisteredAtLoad##CLASS = CLASS::desc();

class HsRxObject {
public:
    HsRxObject() = default;
    HsRxObject(const HsRxObject&) = default;
    HsRxObject& operator=(const HsRxObject&) = default;

    // The virtual operations, in the order of their slots.
    virtual ~HsRxObject();
    virtual HsRxClass* isA() const;
    // A new object of the same class filled by copyFrom; null when the class cannot be created or
    // refuses the copy.
    virtual HsRxObject* clone() const;
    // This level has nothing to copy: it refuses unless a class below overrides it.
    virtual Hsys::ErrorStatus copyFrom(const HsRxObject* other);
    // Identity at this level.
    virtual bool isEqualTo(const HsRxObject* other) const;
    virtual HsRx::Ordering comparedTo(const HsRxObject* other) const;
    // The object itself when it is of the asked protocol class, else null.
    virtual HsRxObject* subQueryX(const HsRxClass* protocolClass) const;

    static HsRxClass* desc();
    static HsRxObject* cast(const HsRxObject* object) { return const_cast<HsRxObject*>(object); }
    bool isKindOf(const HsRxClass* cls) const {
        // Most casts ask for the object's own class, which needs no walk up the parents.
        const HsRxClass* own = isA();
        return own == cls || isDerivedFrom(own, cls);
    }
    HsRxObject* queryX(const HsRxClass* protocolClass) const { return subQueryX(protocolClass); }

private:
    static bool isDerivedFrom(const HsRxClass* own, const HsRxClass* cls);
};

// The usual pseudo constructor of a class: a default-constructed object.
template <class T> HsRxObject* hsrxInstantiateClass() {
    return new T();
}

// Finds a class by name or registers it under that parent; used by HSRX_DEFINE_MEMBERS.
HsRxClass* hsrxRegisterOnce(const wchar_t* name, HsRxClass* parent, int proxyFlags,
                            HsRxObject* (*constructor)());
