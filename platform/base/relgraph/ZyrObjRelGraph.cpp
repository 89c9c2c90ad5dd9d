#include "platform/base/relgraph/ZyrObjRelGraph.h"

#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/obj/ZyrDbImpOwner.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>

namespace {

// The object behind an id, in whatever state it is open: the graph only reads the class and the
// listed references, which every state allows, and an object open for write (its references
// being changed right now) is the very one the graph must see.
const HsDbObject* objectBehind(const HsDbObjectId& id) {
    return id.entry() != nullptr ? id.entry()->object : nullptr;
}

} // namespace

ZyrObjRelGraph::ZyrObjRelGraph(HsDbDatabase* database) : m_database(database) {
    for (const HsDbObjectId& id : database->objectIds())
        m_stale.insert(id);
    m_database->addReactor(this);
}

ZyrObjRelGraph::~ZyrObjRelGraph() {
    if (m_database != nullptr)
        m_database->removeReactor(this);
}

void ZyrObjRelGraph::noteReferencesModified(const HsDbObject* object) {
    HsDbDatabase* database = object != nullptr ? object->database() : nullptr;
    ZyrBaseServices* service = ZyrBaseServices::service();
    if (database == nullptr || service == nullptr)
        return;
    if (ZyrObjRelGraph* graph = service->findObjRelGraph(database))
        graph->referencesModified(object->objectId());
}

void ZyrObjRelGraph::referencesModified(const HsDbObjectId& id) {
    if (!id.isNull() && id.database() == m_database)
        m_stale.insert(id);
}

void ZyrObjRelGraph::objectAppended(HsDbDatabase* /*database*/, HsDbObject* object) {
    referencesModified(object->objectId());
}

void ZyrObjRelGraph::databaseCleared(HsDbDatabase* /*database*/) {
    clear();
}

void ZyrObjRelGraph::goodbye(HsDbDatabase* /*database*/) {
    clear();
    m_database->removeReactor(this);
    m_database = nullptr;
}

Hsys::ErrorStatus ZyrObjRelGraph::getObjectsOfType(HsRxClass* cls, HsArray<HsDbObjectId>& ids,
                                                   bool exactClassOnly, bool includeErased) {
    if (cls == nullptr)
        return Hsys::eNullPointer;
    refresh();
    std::vector<HsDbObjectId> found;
    for (const auto& [objectClass, members] : m_byClass)
        if (objectClass == cls || (!exactClassOnly && objectClass->isDerivedFrom(cls)))
            found.insert(found.end(), members.begin(), members.end());
    std::sort(found.begin(), found.end());
    for (const HsDbObjectId& id : found)
        if (includeErased || !id.isErased())
            ids.append(id);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrObjRelGraph::getReferencesToMe(const HsDbObject* object,
                                                    HsArray<HsDbObjectId>& ids, HsArray<int>& types,
                                                    bool excludeErased) {
    if (object == nullptr)
        return Hsys::eNullPointer;
    if (m_database == nullptr || object->database() != m_database)
        return Hsys::eBadArgument;
    refresh();
    const auto incoming = m_incoming.find(object->objectId());
    if (incoming == m_incoming.end())
        return Hsys::eSuccess;
    for (const auto& [referrer, type] : incoming->second) {
        if (excludeErased && referrer.isErased())
            continue;
        ids.append(referrer);
        types.append(type);
    }
    return Hsys::eSuccess;
}

void ZyrObjRelGraph::refresh() {
    for (const HsDbObjectId& id : m_stale)
        collect(id);
    m_stale.clear();
}

void ZyrObjRelGraph::collect(const HsDbObjectId& id) {
    if (const auto known = m_nodes.find(id); known != m_nodes.end()) {
        forget(id, known->second);
        m_nodes.erase(known);
    }
    const HsDbObject* object = objectBehind(id);
    if (object == nullptr)
        return;
    Node node;
    node.cls = object->isA();
    if (const ZyrDbImpOwner* owner = ZyrDbImpOwner::of(object)) {
        ZyrObjReferenceMap map;
        owner->getReferencedObjects(map);
        for (int i = 0; i < map.count(); ++i)
            if (map.at(i)->id().database() == m_database)
                node.references.emplace_back(map.at(i)->id(), map.at(i)->relationType());
        std::sort(node.references.begin(), node.references.end());
        node.references.erase(std::unique(node.references.begin(), node.references.end()),
                              node.references.end());
    }
    m_byClass[node.cls].insert(id);
    for (const auto& [target, type] : node.references)
        m_incoming[target].emplace(id, type);
    m_nodes.emplace(id, std::move(node));
}

void ZyrObjRelGraph::forget(const HsDbObjectId& id, const Node& node) {
    if (const auto members = m_byClass.find(node.cls); members != m_byClass.end()) {
        members->second.erase(id);
        if (members->second.empty())
            m_byClass.erase(members);
    }
    for (const auto& [target, type] : node.references) {
        const auto incoming = m_incoming.find(target);
        if (incoming == m_incoming.end())
            continue;
        incoming->second.erase({id, type});
        if (incoming->second.empty())
            m_incoming.erase(incoming);
    }
}

void ZyrObjRelGraph::clear() {
    m_nodes.clear();
    m_incoming.clear();
    m_byClass.clear();
    m_stale.clear();
}
