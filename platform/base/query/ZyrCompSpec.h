// Component descriptions: for one class of drawing objects, where the property sets of an object
// may lie (on the object itself, and on further objects such as its style).
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/rx/HsRxObject.h"
#include "platform/host/ut/HsArray.h"

class HsDbObject;

class ZyrCompSpec : public HsRxObject {
    HSRX_DECLARE_MEMBERS(ZyrCompSpec)

public:
    // The virtual operations, in the order of their slots.
    // The class of objects this description serves; null at this level, which serves none.
    virtual HsRxClass* worksWith() const;
    // Appends the further classes whose objects may carry the property sets (as HsRxClass*).
    virtual void extendedClasses(HsArray<void*>& classes) const;
    // Appends the locations of an object's property sets: this level gives the object itself.
    // eNullPointer for a null object; otherwise the status of addLocation.
    virtual Hsys::ErrorStatus propSetLocations(HsDbObject* object, HsArray<HsDbObjectId>& ids,
                                               ZyrRmCStringArray& names);

    // Appends one location with the name a user knows it by: a dictionary record's name, else the
    // display name of the object's class. eNullId for the null id, eWasErased for an id without a
    // live object, eAlreadyPresent for a location listed already; nothing is appended then.
    static Hsys::ErrorStatus addLocation(const HsDbObjectId& id, HsArray<HsDbObjectId>& ids,
                                         ZyrRmCStringArray& names);
};
