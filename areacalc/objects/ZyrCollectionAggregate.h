// A growing array of items, as the module's objects keep their lists of classes and ids.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <vector>

template <class T> class ZyrCollectionAggregate {
public:
    using value_type = T;
    using const_iterator = typename std::vector<T>::const_iterator;

    // Appends, whatever the collection holds.
    Hsys::ErrorStatus add(const T& item) {
        m_items.push_back(item);
        return Hsys::eSuccess;
    }

    int count() const { return static_cast<int>(m_items.size()); }
    const T& at(int index) const { return m_items.at(static_cast<std::size_t>(index)); }
    bool contains(const T& item) const {
        for (const T& held : m_items)
            if (held == item)
                return true;
        return false;
    }
    const std::vector<T>& items() const { return m_items; }
    const_iterator begin() const { return m_items.begin(); }
    const_iterator end() const { return m_items.end(); }
    void clear() { m_items.clear(); }

    friend bool operator==(const ZyrCollectionAggregate&, const ZyrCollectionAggregate&) = default;

protected:
    std::vector<T>& mutableItems() { return m_items; }

private:
    std::vector<T> m_items;
};
