// The way back from a member to the groups that hold it, asked of the relationship graph: a
// member has no pointer to its groups.
#pragma once

#include "areacalc/objects/ZyrGroupHandlerOperations.h"
#include "platform/base/zyrtl/zyrtlObjectId.h"

class ZyrGroupHandlerFunctional {
public:
    // Appends the living objects of Group or a derived class that refer to the object behind id,
    // in the order of their handles. Always eSuccess: an id that cannot be asked about has no
    // groups.
    template <class Group>
    static Hsys::ErrorStatus ownerGroups(const HsDbObjectId& id, std::vector<HsDbObjectId>& out) {
        std::vector<HsDbObjectId> referrers;
        ZyrGroupHandlerOperations::queryReferences(id, referrers, id.database());
        for (const HsDbObjectId& referrer : referrers)
            if (zyrtl::isAlive(referrer) && zyrtl::isDerivedFromType<Group>(referrer))
                out.push_back(referrer);
        return Hsys::eSuccess;
    }
};
