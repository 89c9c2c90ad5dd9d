// A list of (name, id) pairs, as dictionaries hand out their records and objects list what they
// use.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbObjectId.h"

#include <vector>

class ZyrStrObjIdList {
public:
    struct Entry {
        ZyrRmCString name;
        HsDbObjectId id;
        friend bool operator==(const Entry&, const Entry&) = default;
    };

    // Appends, in the order given; the list keeps duplicates.
    void add(const ZyrRmCString& name, const HsDbObjectId& id) { m_entries.push_back({name, id}); }
    void removeAll() { m_entries.clear(); }

    int count() const { return static_cast<int>(m_entries.size()); }
    bool isEmpty() const { return m_entries.empty(); }
    // Each throws std::out_of_range for an index outside the list.
    const ZyrRmCString& nameAt(int index) const { return at(index).name; }
    const HsDbObjectId& idAt(int index) const { return at(index).id; }

    // The first entry of the name, compared as record names are (A-Z case folded); -1 for none.
    int find(const wchar_t* name) const;
    // The first entry of the id; -1 for none.
    int find(const HsDbObjectId& id) const;

    std::vector<Entry>::const_iterator begin() const { return m_entries.begin(); }
    std::vector<Entry>::const_iterator end() const { return m_entries.end(); }

    friend bool operator==(const ZyrStrObjIdList&, const ZyrStrObjIdList&) = default;

private:
    const Entry& at(int index) const { return m_entries.at(static_cast<size_t>(index)); }

    std::vector<Entry> m_entries;
};
