// A small most-recently-used list of results by key, with tolerance-equal keys.
#pragma once

#include "platform/host/ge/HsGeContext.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <deque>
#include <utility>

namespace zyrtl {

// The value a new entry starts with, before the caller assigns its result.
template <class Key, class Value> struct default_value {
    Value operator()(const Key& /*key*/) const { return Value(); }
};

// When two keys are the same entry. Only doubles are cached, and a result computed for a value
// serves every value the geometry cannot tell from it.
template <class T> struct equal_to;

template <> struct equal_to<double> {
    // Reads the tolerance at every call, since the host may set it after a cache was made.
    bool operator()(double a, double b) const {
        return std::fabs(a - b) <= HsGeContext::gTol.equalPoint();
    }
};

// Entries are kept most recently used first and searched linearly from the front: the list is
// short, and among keys that are all within tolerance of a probe the most recently used is the
// one that answers. A hash or an ordered index could not give that answer, since tolerance
// equality is not transitive.
template <class Key, class Value, class DefaultValue = default_value<Key, Value>,
          class Equal = equal_to<Key>>
class cache {
public:
    using entry_type = std::pair<Key, Value>;
    using entries_type = std::deque<entry_type>;
    using const_iterator = typename entries_type::const_iterator;

    static constexpr unsigned kDefaultMaxSize = 200;

    // A cache holds at least the one entry that operator[] hands out, so a size of 0 counts as 1.
    explicit cache(unsigned maxSize = kDefaultMaxSize) : m_maxSize(std::max(maxSize, 1u)) {}

    // Whether an entry answers for the key; the order is left as it is.
    bool has(const Key& key) const { return find_in_cache(key) != m_entries.end(); }

    // The value of the key's entry, which afterwards is the front one. A key without an entry
    // gets a new one with the default value, and the least recently used entry goes if the list
    // is then too long. A hit keeps the key it was stored under. The reference stays valid until
    // the next operator[] or clear.
    Value& operator[](const Key& key) {
        const const_iterator found = find_in_cache(key);
        if (found == m_entries.end()) {
            m_entries.emplace_front(key, DefaultValue()(key));
            if (m_entries.size() > m_maxSize)
                m_entries.pop_back();
        } else if (found != m_entries.begin()) {
            entry_type hit = *found;
            m_entries.erase(found);
            m_entries.push_front(std::move(hit));
        }
        return m_entries.front().second;
    }

    // The first entry from the front whose key is the same as `key`, or entries().end().
    const_iterator find_in_cache(const Key& key) const {
        const Equal equal;
        return std::find_if(m_entries.begin(), m_entries.end(),
                            [&](const entry_type& entry) { return equal(entry.first, key); });
    }

    bool empty() const { return m_entries.empty(); }
    size_t size() const { return m_entries.size(); }
    unsigned maxSize() const { return m_maxSize; }
    void clear() { m_entries.clear(); }
    // Most recently used first.
    const entries_type& entries() const { return m_entries; }

private:
    entries_type m_entries;
    unsigned m_maxSize;
};

} // namespace zyrtl
