#include "platform/base/dict/ZyrStrObjIdList.h"

#include "platform/host/db/HsDbNames.h"

#include <algorithm>

namespace {

template <class Predicate>
int indexOf(const std::vector<ZyrStrObjIdList::Entry>& entries, Predicate matches) {
    const auto found = std::find_if(entries.begin(), entries.end(), matches);
    return found == entries.end() ? -1 : static_cast<int>(found - entries.begin());
}

} // namespace

int ZyrStrObjIdList::find(const wchar_t* name) const {
    if (name == nullptr)
        return -1;
    return indexOf(m_entries,
                   [name](const Entry& entry) { return hsdbNamesEqual(entry.name.str(), name); });
}

int ZyrStrObjIdList::find(const HsDbObjectId& id) const {
    return indexOf(m_entries, [&id](const Entry& entry) { return entry.id == id; });
}
