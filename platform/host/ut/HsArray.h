// The host's growable array, as its interfaces pass lists of ids, classes and handles.
#pragma once

#include <algorithm>
#include <vector>

template <class T> class HsArray {
public:
    HsArray() = default;
    HsArray(std::initializer_list<T> items) : m_items(items) {}

    int length() const { return static_cast<int>(m_items.size()); }
    bool isEmpty() const { return m_items.empty(); }
    // Index of the appended item.
    int append(const T& item) {
        m_items.push_back(item);
        return length() - 1;
    }
    const T& at(int index) const { return m_items.at(static_cast<size_t>(index)); }
    T& at(int index) { return m_items.at(static_cast<size_t>(index)); }
    const T& operator[](int index) const { return at(index); }
    T& operator[](int index) { return at(index); }
    const T& last() const { return m_items.back(); }
    void removeAt(int index) { m_items.erase(m_items.begin() + index); }
    void removeLast() { m_items.pop_back(); }
    void insertAt(int index, const T& item) { m_items.insert(m_items.begin() + index, item); }
    // Index of the first equal item, or -1.
    int find(const T& item) const {
        auto found = std::find(m_items.begin(), m_items.end(), item);
        return found == m_items.end() ? -1 : static_cast<int>(found - m_items.begin());
    }
    bool contains(const T& item) const { return find(item) >= 0; }
    void setLogicalLength(int length) { m_items.resize(static_cast<size_t>(length)); }
    void removeAll() { m_items.clear(); }

    auto begin() const { return m_items.begin(); }
    auto end() const { return m_items.end(); }
    auto begin() { return m_items.begin(); }
    auto end() { return m_items.end(); }
    const std::vector<T>& asVector() const { return m_items; }

    friend bool operator==(const HsArray&, const HsArray&) = default;

private:
    std::vector<T> m_items;
};
