// The changes one edit reported, in order, as they travel up from a nested object to its record.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <memory>
#include <vector>

class ZyrParamInfo;

// Owns its entries. Every level that a change passes may look at the last entry and add one of
// its own, so that the record reports the change in its own terms.
class ZyrParamContainer {
public:
    ZyrParamContainer();
    ~ZyrParamContainer();
    ZyrParamContainer(const ZyrParamContainer&) = delete;
    ZyrParamContainer& operator=(const ZyrParamContainer&) = delete;

    // Takes ownership; eNullPointer for null.
    Hsys::ErrorStatus add(ZyrParamInfo* info);
    int count() const { return static_cast<int>(m_entries.size()); }
    // Null outside [0, count()).
    const ZyrParamInfo* at(int index) const;
    // The entry added last, or null when there is none.
    const ZyrParamInfo* last() const;

private:
    std::vector<std::unique_ptr<ZyrParamInfo>> m_entries;
};
