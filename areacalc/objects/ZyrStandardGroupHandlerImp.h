// The group handler for one pair of group classes and one leaf class.
#pragma once

#include "areacalc/objects/ZyrGroupHandler.h"
#include "areacalc/objects/ZyrGroupHandlerImp.h"
#include "platform/host/db/HsDbObject.h"

#include <utility>

// ImpGroup is the implementation class of the group (a ZyrImpGeo) that holds the handler, DbGroup
// its public class, whose groupHandler() const gives the group's const ZyrGroupHandler*; nodes
// must be DbGroups and leafs Leafs, of those very classes.
template <class ImpGroup, class DbGroup, class Leaf>
class ZyrStandardGroupHandlerImp : public ZyrGroupHandlerImp {
public:
    explicit ZyrStandardGroupHandlerImp(ImpGroup* parent)
        : ZyrGroupHandlerImp(parent, DbGroup::desc(), Leaf::desc()) {}

    // Another group is opened for read and closed at once: the database keeps it in memory, so its
    // handler stays usable. There is no status to give back; an id that cannot be opened does a
    // bare rethrow, which with no exception in flight ends the process. Callers skip erased ids.
    const ZyrGroupHandlerImp& handlerById(const HsDbObjectId& id) const override {
        if (id == ownObjectId())
            return *this;
        DbGroup* group = nullptr;
        if (hsdbOpenObject(group, id, HsDb::kForRead) != Hsys::eSuccess)
            throw;
        // The const accessor: the other one asserts write.
        const ZyrGroupHandlerImp& handler = std::as_const(*group).groupHandler()->imp();
        group->close();
        return handler;
    }
};
