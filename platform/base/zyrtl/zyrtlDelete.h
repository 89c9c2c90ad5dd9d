// Deleting the owned pointers that containers hold.
#pragma once

#include <memory>
#include <vector>

namespace zyrtl {

template <class T> struct deleteItem;

// Deletes a pointer unless it is null and answers true, so it serves for_each and remove_if alike.
template <class T> struct deleteItem<T*> {
    bool operator()(T* item) const {
        delete item;
        return true;
    }
};

// Deletes every pointer of a container and leaves the container empty.
template <class Container> void deleteItems(Container& container) {
    for (auto* item : container)
        delete item;
    container.clear();
}

// Hands the objects of a list of owners over as plain pointers, for an owner that keeps plain ones;
// the list is left holding nulls.
template <class T> std::vector<T*> releaseAll(std::vector<std::unique_ptr<T>>& owned) {
    std::vector<T*> pointers;
    pointers.reserve(owned.size());
    for (std::unique_ptr<T>& item : owned)
        pointers.push_back(item.release());
    return pointers;
}

} // namespace zyrtl
