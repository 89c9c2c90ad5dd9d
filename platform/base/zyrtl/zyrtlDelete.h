// Deleting the owned pointers that containers hold.
#pragma once

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

} // namespace zyrtl
