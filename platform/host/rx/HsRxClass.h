// A run-time class descriptor and the class dictionary that names them.
#pragma once

#include "platform/host/rx/HsRxObject.h"

#include <string>

class HsRxClass : public HsRxObject {
    HSRX_DECLARE_MEMBERS(HsRxClass)

public:
    using PseudoConstructor = HsRxObject* (*)();
    // Lets a class supply its own application text on demand (the long registration's last
    // argument): class, text out, and a request code.
    using AppDataCallback = void (*)(const HsRxClass*, wchar_t*&, int);

    struct Registration {
        std::wstring name;
        HsRxClass* parent = nullptr;
        int drawingVersion = 0;
        int maintenanceVersion = 0;
        int proxyFlags = 0;
        PseudoConstructor constructor = nullptr;
        std::wstring recordName;
        std::wstring appDescription;
        AppDataCallback appDataCallback = nullptr;
    };

    explicit HsRxClass(Registration registration);

    // Classes are ordered by name; eEqual only for the very same class, eNotOrderable against an
    // object that is no class.
    HsRx::Ordering comparedTo(const HsRxObject* other) const override;

    const wchar_t* name() const { return m_reg.name.c_str(); }
    HsRxClass* myParent() const { return m_reg.parent; }
    // True for the class itself and for every class below it; false for null.
    bool isDerivedFrom(const HsRxClass* other) const;
    // A new object through the pseudo constructor; null for a class that has none.
    HsRxObject* create() const;
    PseudoConstructor pseudoConstructor() const { return m_reg.constructor; }
    int proxyFlags() const { return m_reg.proxyFlags; }
    int drawingVersion() const { return m_reg.drawingVersion; }
    int maintenanceVersion() const { return m_reg.maintenanceVersion; }
    // The name under which instances are filed; empty for a class that is not filed by its own record.
    const wchar_t* recordName() const { return m_reg.recordName.c_str(); }
    const wchar_t* appDescription() const { return m_reg.appDescription.c_str(); }
    AppDataCallback appDataCallback() const { return m_reg.appDataCallback; }

private:
    Registration m_reg;
};

// The long form, for classes filed under a record name. Null when the name is taken or the parent
// is unknown; the registration already present stays.
HsRxClass* newHsRxClass(const wchar_t* className, const wchar_t* parentClassName, int drawingVersion,
                        int maintenanceVersion, int proxyFlags,
                        HsRxClass::PseudoConstructor constructor, const wchar_t* recordName,
                        const wchar_t* appDescription,
                        HsRxClass::AppDataCallback appDataCallback = nullptr);

// The short form, for classes that are not filed by a record of their own.
HsRxClass* newHsRxClass(const wchar_t* className, const wchar_t* parentClassName, int proxyFlags = 0,
                        HsRxClass::PseudoConstructor constructor = nullptr,
                        const wchar_t* recordName = nullptr, const wchar_t* appDescription = nullptr);

// Takes a class out of the class dictionary and deletes it, as a module does at unload. A class
// that is not the registered one under its name is only deleted.
void deleteHsRxClass(HsRxClass* cls);

// The class registered under a name, or null.
HsRxClass* hsrxFindHsRxClass(const wchar_t* className);

// Prints the text on the error stream and ends the process. Used when the class tree is broken
// beyond repair ("Class mismatch").
[[noreturn]] void hsrx_abort(const wchar_t* format, ...);
