#include "areacalc/objects/ZyrGroupHandlerOperations.h"

#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbObjectPointer.h"

namespace {

ZyrObjRelGraph* graphOf(HsDbDatabase* db) {
    if (db == nullptr)
        db = hsdbHostApplicationServices()->workingDatabase();
    ZyrBaseServices* service = ZyrBaseServices::service();
    return service != nullptr ? service->objRelGraph(db) : nullptr;
}

} // namespace

Hsys::ErrorStatus ZyrGroupHandlerOperations::queryObjects(std::vector<HsDbObjectId>& out,
                                                          HsRxClass* cls, HsDbDatabase* db) {
    ZyrObjRelGraph* graph = graphOf(db);
    if (graph == nullptr)
        return Hsys::eNullPointer;
    HsArray<HsDbObjectId> ids;
    graph->getObjectsOfType(cls, ids, false, true);
    if (ids.isEmpty())
        return Hsys::eNothingFound;
    out = ids.asVector();
    std::erase_if(out, [](const HsDbObjectId& id) { return id.isErased(); });
    return out.empty() ? Hsys::eNullId : Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrGroupHandlerOperations::queryReferences(const HsDbObjectId& id,
                                                             std::vector<HsDbObjectId>& out,
                                                             HsDbDatabase* db) {
    ZyrObjRelGraph* graph = graphOf(db);
    if (graph == nullptr)
        return Hsys::eNullPointer;
    const HsDbObjectPointer<HsDbObject> object(id, HsDb::kForRead);
    if (!object)
        return object.openStatus();
    HsArray<HsDbObjectId> ids;
    HsArray<int> types;
    graph->getReferencesToMe(object.object(), ids, types, true);
    out.insert(out.end(), ids.begin(), ids.end());
    return Hsys::eSuccess;
}
