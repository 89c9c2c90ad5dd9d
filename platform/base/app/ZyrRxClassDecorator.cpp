#include "platform/base/app/ZyrRxClassDecorator.h"

#include "platform/base/res/ZyrRmCString.h"

#include <algorithm>
#include <map>

namespace {

// Decorators are static objects of other images: the list must exist before the first of them
// and outlive the last, so it is never destroyed.
std::vector<const ZyrRxClassDecorator*>& decoratorList() {
    static auto* list = new std::vector<const ZyrRxClassDecorator*>;
    return *list;
}

std::map<HsModuleHandle, std::wstring>& moduleNames() {
    static auto* names = new std::map<HsModuleHandle, std::wstring>;
    return *names;
}

bool textOf(const ZyrRxClassDecorator* decorator, int id, ZyrRmCString& out) {
    if (decorator == nullptr || id == ZyrRxClassDecorator::kNoText)
        return false;
    auto name = moduleNames().find(decorator->module());
    const std::wstring appName = name != moduleNames().end() ? name->second : std::wstring();
    out = ZyrRmCString(appName.c_str(), static_cast<unsigned int>(id), false);
    return true;
}

} // namespace

ZyrRxClassDecorator::ZyrRxClassDecorator(const std::type_info& cls, const std::type_info& parent,
                                         ClassFunction rxInit, ClassFunction desc,
                                         const HsModuleHandle* module, int displayNameId,
                                         int secondTextId)
    : m_type(cls), m_parentType(parent), m_rxInit(rxInit), m_desc(desc), m_module(module),
      m_displayNameId(displayNameId), m_secondTextId(secondTextId) {
    ZyrDecoratorManager::add(this);
}

ZyrRxClassDecorator::~ZyrRxClassDecorator() { ZyrDecoratorManager::remove(this); }

void ZyrDecoratorManager::add(const ZyrRxClassDecorator* decorator) {
    decoratorList().push_back(decorator);
}

void ZyrDecoratorManager::remove(const ZyrRxClassDecorator* decorator) {
    auto& list = decoratorList();
    list.erase(std::remove(list.begin(), list.end(), decorator), list.end());
}

int ZyrDecoratorManager::registerClasses(HsModuleHandle module) {
    int count = 0;
    // rxInit may build further decorators' classes; walk a copy so the list can change meanwhile.
    const auto list = decoratorList();
    for (const ZyrRxClassDecorator* decorator : list) {
        if (decorator->module() != module)
            continue;
        decorator->rxInit();
        ++count;
    }
    return count;
}

void ZyrDecoratorManager::bindModule(HsModuleHandle module, const std::wstring& appName) {
    moduleNames()[module] = appName;
}

void ZyrDecoratorManager::unbindModule(HsModuleHandle module) { moduleNames().erase(module); }

const ZyrRxClassDecorator* ZyrDecoratorManager::find(const HsRxClass* cls) {
    if (cls == nullptr)
        return nullptr;
    for (const ZyrRxClassDecorator* decorator : decoratorList())
        if (decorator->desc() == cls)
            return decorator;
    return nullptr;
}

bool ZyrDecoratorManager::displayName(const HsRxClass* cls, ZyrRmCString& out) {
    const ZyrRxClassDecorator* decorator = find(cls);
    return decorator != nullptr && textOf(decorator, decorator->displayNameId(), out);
}

bool ZyrDecoratorManager::secondText(const HsRxClass* cls, ZyrRmCString& out) {
    const ZyrRxClassDecorator* decorator = find(cls);
    return decorator != nullptr && textOf(decorator, decorator->secondTextId(), out);
}

const std::vector<const ZyrRxClassDecorator*>& ZyrDecoratorManager::decorators() {
    return decoratorList();
}
