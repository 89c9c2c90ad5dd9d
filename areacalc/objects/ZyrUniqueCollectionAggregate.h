// A collection that holds each item once.
#pragma once

#include "areacalc/objects/ZyrCollectionAggregate.h"

#include <set>
#include <vector>

template <class T> class ZyrUniqueCollectionAggregate : public ZyrCollectionAggregate<T> {
public:
    // Appends an item that is not held yet; eBadArgument for one that is.
    Hsys::ErrorStatus add(const T& item) {
        if (this->contains(item))
            return Hsys::eBadArgument;
        return ZyrCollectionAggregate<T>::add(item);
    }

    // Adds the items that are not held yet. When any is new, the whole collection comes out in
    // ascending order of the items' values (for pointers, the order of the addresses); when none
    // is, the collection keeps its order. Always eSuccess.
    Hsys::ErrorStatus add(const std::vector<T>& items) {
        if (items.empty())
            return Hsys::eSuccess;
        std::set<T> merged(this->begin(), this->end());
        merged.insert(items.begin(), items.end());
        if (static_cast<int>(merged.size()) == this->count())
            return Hsys::eSuccess;
        std::vector<T> sorted;
        sorted.reserve(merged.size());
        for (const T& item : merged)
            sorted.push_back(item);
        this->mutableItems().swap(sorted);
        return Hsys::eSuccess;
    }
};
