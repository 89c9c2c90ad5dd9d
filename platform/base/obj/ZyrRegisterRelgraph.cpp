#include "platform/base/obj/ZyrRegisterRelgraph.h"

#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/host/db/HsDbObject.h"

#include <algorithm>
#include <vector>

namespace {

// The public objects whose fields are being read, outermost first. Reads nest only within one
// object (its implementation object and what is nested in that), so the list stays short.
std::vector<const HsDbObject*>& objectsBeingRead() {
    static std::vector<const HsDbObject*> reading;
    return reading;
}

const HsDbObject* publicObjectOf(const HsRxObject* object) {
    if (const HsDbObject* dbObject = HsDbObject::cast(object))
        return dbObject;
    if (const ZyrImpObj* imp = ZyrImpObj::cast(object))
        return imp->dbParent();
    return nullptr;
}

} // namespace

ZyrRegisterRelgraph::ZyrRegisterRelgraph(HsDbBdfFiler* /*filer*/, const HsRxObject* object,
                                         const HsRxClass* /*cls*/) {
    const HsDbObject* dbObject = publicObjectOf(object);
    std::vector<const HsDbObject*>& reading = objectsBeingRead();
    if (dbObject == nullptr || std::find(reading.begin(), reading.end(), dbObject) != reading.end())
        return;
    reading.push_back(dbObject);
    m_outermostOf = dbObject;
}

ZyrRegisterRelgraph::~ZyrRegisterRelgraph() {
    if (m_outermostOf == nullptr)
        return;
    std::erase(objectsBeingRead(), m_outermostOf);
    try {
        ZyrObjRelGraph::noteReferencesModified(m_outermostOf);
    } catch (...) {
        // Noting a change can only fail for want of memory; the graph then stays as it was.
    }
}
