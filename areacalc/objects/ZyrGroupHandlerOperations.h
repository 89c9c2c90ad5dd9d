// Questions to a drawing's relationship graph on behalf of groups: the objects of a class, and
// the objects that refer to one, such as the groups that hold it.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <vector>

class HsDbDatabase;
class HsRxClass;

// A null database stands for the host's working database. Both answer eNullPointer when there is
// no relationship graph: no base service runs, or no database.
class ZyrGroupHandlerOperations {
public:
    // out becomes the objects of cls and of its derived classes, in the order of their handles,
    // erased ones left out. eNothingFound, with out untouched, when there is no object of the
    // class, erased or not; eNullId when all of them are erased.
    static Hsys::ErrorStatus queryObjects(std::vector<HsDbObjectId>& out, HsRxClass* cls,
                                          HsDbDatabase* db);
    // Appends the objects that refer to the object behind id and are not erased, in the order of
    // their handles (one that refers in two ways stands twice). The status of opening id for read
    // when that fails; nothing is appended when the object is not in db.
    static Hsys::ErrorStatus queryReferences(const HsDbObjectId& id, std::vector<HsDbObjectId>& out,
                                             HsDbDatabase* db);
};
