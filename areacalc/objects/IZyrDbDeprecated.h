// The migration interface of the module's public classes: each object makes its successor of the
// newer sibling module.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsArray.h"
#include "platform/host/ut/HsysErrorStatus.h"

class IZyrDbDeprecated {
public:
    virtual ~IZyrDbDeprecated() = default;

    // Makes the object's successor; its id goes into first unless the class says otherwise, and
    // second takes what the class puts aside.
    virtual Hsys::ErrorStatus deprecate(HsArray<HsDbObjectId>& first,
                                        HsArray<HsDbObjectId>& second) const = 0;
};
