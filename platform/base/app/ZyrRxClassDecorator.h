// Class decorators: one static object per run-time class of a module, built at load in a fixed
// order. They let the application frame register a module's whole class table, and give every
// class its display name from the module's text resource.
#pragma once

#include "platform/host/ut/HsModuleHandle.h"

#include <string>
#include <typeinfo>
#include <vector>

class HsRxClass;
class ZyrRmCString;

class ZyrRxClassDecorator {
public:
    using ClassFunction = HsRxClass* (*)();
    static constexpr int kNoText = -1;

    // module is the address of the module's handle variable: the handle itself is known only
    // once the image is attached, after the decorators were built.
    ZyrRxClassDecorator(const std::type_info& cls, const std::type_info& parent, ClassFunction rxInit,
                        ClassFunction desc, const HsModuleHandle* module, int displayNameId,
                        int secondTextId);
    ~ZyrRxClassDecorator();
    ZyrRxClassDecorator(const ZyrRxClassDecorator&) = delete;
    ZyrRxClassDecorator& operator=(const ZyrRxClassDecorator&) = delete;

    const std::type_info& type() const { return m_type; }
    const std::type_info& parentType() const { return m_parentType; }
    HsRxClass* rxInit() const { return m_rxInit(); }
    HsRxClass* desc() const { return m_desc(); }
    HsModuleHandle module() const { return m_module != nullptr ? *m_module : nullptr; }
    int displayNameId() const { return m_displayNameId; }
    int secondTextId() const { return m_secondTextId; }

private:
    const std::type_info& m_type;
    const std::type_info& m_parentType;
    ClassFunction m_rxInit;
    ClassFunction m_desc;
    const HsModuleHandle* m_module;
    int m_displayNameId;
    int m_secondTextId;
};

class ZyrDecoratorManager {
public:
    // Registers the classes of one module by calling each decorator's rxInit, in the order the
    // decorators were built. Returns how many were registered.
    static int registerClasses(HsModuleHandle module);
    // Ties a module's handle to the application name under which its texts are registered.
    static void bindModule(HsModuleHandle module, const std::wstring& appName);
    static void unbindModule(HsModuleHandle module);

    // The decorator whose desc() is the class, or null.
    static const ZyrRxClassDecorator* find(const HsRxClass* cls);
    // The class's display name from its module's texts. False, and out untouched, for a class
    // without a decorator or without a display-name text.
    static bool displayName(const HsRxClass* cls, ZyrRmCString& out);
    static bool secondText(const HsRxClass* cls, ZyrRmCString& out);

    // All living decorators in the order of construction.
    static const std::vector<const ZyrRxClassDecorator*>& decorators();

private:
    friend class ZyrRxClassDecorator;
    static void add(const ZyrRxClassDecorator* decorator);
    static void remove(const ZyrRxClassDecorator* decorator);
};
