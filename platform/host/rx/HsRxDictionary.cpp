#include "platform/host/rx/HsRxDictionary.h"

#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(HsRxDictionary, HsRxObject, 0, hsrxInstantiateClass<HsRxDictionary>)

HsRxObject* HsRxDictionary::at(const wchar_t* key) const {
    if (key == nullptr)
        return nullptr;
    auto found = m_entries.find(key);
    return found != m_entries.end() ? found->second : nullptr;
}

HsRxObject* HsRxDictionary::atPut(const wchar_t* key, HsRxObject* object) {
    if (key == nullptr)
        return nullptr;
    HsRxObject*& slot = m_entries[key];
    HsRxObject* previous = slot;
    slot = object;
    return previous;
}

bool HsRxDictionary::has(const wchar_t* key) const {
    return key != nullptr && m_entries.find(key) != m_entries.end();
}

HsRxObject* HsRxDictionary::remove(const wchar_t* key) {
    if (key == nullptr)
        return nullptr;
    auto found = m_entries.find(key);
    if (found == m_entries.end())
        return nullptr;
    HsRxObject* object = found->second;
    m_entries.erase(found);
    return object;
}
