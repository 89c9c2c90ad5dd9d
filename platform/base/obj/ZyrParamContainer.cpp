#include "platform/base/obj/ZyrParamContainer.h"

#include "platform/base/obj/ZyrParamInfo.h"

ZyrParamContainer::ZyrParamContainer() = default;

ZyrParamContainer::~ZyrParamContainer() = default;

Hsys::ErrorStatus ZyrParamContainer::add(ZyrParamInfo* info) {
    if (info == nullptr)
        return Hsys::eNullPointer;
    m_entries.emplace_back(info);
    return Hsys::eSuccess;
}

const ZyrParamInfo* ZyrParamContainer::at(int index) const {
    if (index < 0 || index >= count())
        return nullptr;
    return m_entries[static_cast<std::size_t>(index)].get();
}

const ZyrParamInfo* ZyrParamContainer::last() const {
    return m_entries.empty() ? nullptr : m_entries.back().get();
}
