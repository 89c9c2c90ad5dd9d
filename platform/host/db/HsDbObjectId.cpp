#include "platform/host/db/HsDbObjectId.h"

#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbObject.h"

#include <ostream>

const HsDbObjectId HsDbObjectId::kNull;

bool HsDbObjectId::isValid() const {
    return m_entry != nullptr && m_entry->object != nullptr;
}

bool HsDbObjectId::isErased() const {
    return m_entry != nullptr && m_entry->erased;
}

HsRxClass* HsDbObjectId::objectClass() const {
    return isValid() ? m_entry->object->isA() : nullptr;
}

HsDbDatabase* HsDbObjectId::database() const {
    return m_entry != nullptr ? m_entry->database : nullptr;
}

std::uint64_t HsDbObjectId::handle() const {
    return m_entry != nullptr ? m_entry->handle : 0;
}

std::strong_ordering operator<=>(const HsDbObjectId& a, const HsDbObjectId& b) {
    if (auto byHandle = a.handle() <=> b.handle(); byHandle != 0)
        return byHandle;
    return std::compare_three_way()(a.entry(), b.entry());
}

std::ostream& operator<<(std::ostream& out, const HsDbObjectId& id) {
    return out << id.handle();
}
