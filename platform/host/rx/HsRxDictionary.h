// A dictionary of run-time objects by name. It does not own its entries: whoever puts an object
// in takes it out and deletes it.
#pragma once

#include "platform/host/rx/HsRxObject.h"

#include <map>
#include <string>

class HsRxDictionary : public HsRxObject {
    HSRX_DECLARE_MEMBERS(HsRxDictionary)

public:
    using Entries = std::map<std::wstring, HsRxObject*>;

    // The entry, or null.
    HsRxObject* at(const wchar_t* key) const;
    // Enters or replaces an entry and returns the object it replaced, or null. A null key is refused
    // and gives null.
    HsRxObject* atPut(const wchar_t* key, HsRxObject* object);
    bool has(const wchar_t* key) const;
    // Takes the entry out and returns it, or null when there was none.
    HsRxObject* remove(const wchar_t* key);
    size_t numEntries() const { return m_entries.size(); }

    // Iteration in the order of the keys.
    Entries::const_iterator begin() const { return m_entries.begin(); }
    Entries::const_iterator end() const { return m_entries.end(); }

private:
    Entries m_entries;
};
