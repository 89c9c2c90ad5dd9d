// Questions about the object behind an id that a walker over stored ids asks before it opens one.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/rx/HsRxClass.h"

namespace zyrtl {

// An object stands behind the id and it is not erased: lists keep ids of erased objects, and a
// damaged drawing may leave ids without an object.
inline bool isAlive(const HsDbObjectId& id) {
    return id.isValid() && !id.isErased();
}

// The object behind the id is a T or of a class derived from it; false for an id without an object.
template <class T> bool isDerivedFromType(const HsDbObjectId& id) {
    const HsRxClass* cls = id.objectClass();
    return cls != nullptr && cls->isDerivedFrom(T::desc());
}

} // namespace zyrtl
