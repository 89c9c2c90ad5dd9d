#include "platform/base/query/ZyrCompSpecFactory.h"

#include "platform/base/query/ZyrCompSpec.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>

ZyrCompSpecFactory::ZyrCompSpecFactory() = default;
ZyrCompSpecFactory::~ZyrCompSpecFactory() = default;

std::vector<ZyrCompSpecFactory::Entry>::const_iterator
ZyrCompSpecFactory::find(const HsRxClass* compSpecClass) const {
    return std::find_if(m_entries.begin(), m_entries.end(), [compSpecClass](const Entry& entry) {
        return entry.first == compSpecClass;
    });
}

Hsys::ErrorStatus ZyrCompSpecFactory::registerCompSpec(HsRxClass* compSpecClass) {
    if (compSpecClass == nullptr)
        return Hsys::eNullPointer;
    if (isRegistered(compSpecClass))
        return Hsys::eAlreadyPresent;
    std::unique_ptr<HsRxObject> created(compSpecClass->create());
    if (ZyrCompSpec::cast(created.get()) == nullptr)
        return Hsys::eWrongClass;
    m_entries.emplace_back(compSpecClass, static_cast<ZyrCompSpec*>(created.release()));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrCompSpecFactory::unRegisterCompSpec(const HsRxClass* compSpecClass) {
    if (compSpecClass == nullptr)
        return Hsys::eNullPointer;
    const auto found = find(compSpecClass);
    if (found == m_entries.end())
        return Hsys::eNameNotFound;
    m_entries.erase(found);
    return Hsys::eSuccess;
}

bool ZyrCompSpecFactory::isRegistered(const HsRxClass* compSpecClass) const {
    return find(compSpecClass) != m_entries.end();
}

ZyrCompSpec* ZyrCompSpecFactory::compSpecFor(const HsDbObject* object) const {
    if (object == nullptr)
        return nullptr;
    const HsRxClass* objectClass = object->isA();
    for (const Entry& entry : m_entries) {
        const HsRxClass* served = entry.second->worksWith();
        if (served != nullptr && objectClass->isDerivedFrom(served))
            return entry.second.get();
    }
    return nullptr;
}
