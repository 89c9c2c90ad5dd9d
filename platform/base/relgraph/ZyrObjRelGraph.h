// The relationship graph of one database: the objects by class, and who refers to whom, as the
// objects list their references (getReferencedObjects).
#pragma once

#include "platform/host/db/HsDbDatabaseReactor.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsArray.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <set>
#include <unordered_map>
#include <unordered_set>
#include <utility>
#include <vector>

class HsDbDatabase;
class HsDbObject;
class HsRxClass;

// References are stored on the referring side only (a group lists its members); the graph gives
// the way back. It learns of changes without being asked:
// - an object that enters the database (added, read from a drawing file, handed over) is
//   reported by the database;
// - an object whose references changed calls recordReferencesModified (ZyrImpObj's
//   recordParentReferencesModified), and every read of an object's fields does it too
//   (ZyrRegisterRelgraph), so loads and undos are covered;
// - erase and unerase need no report: whether an object is erased is read from its id when the
//   graph answers, so the answer is right whoever erased it, an aborted transaction included.
// Reported objects are collected again when the graph is next asked, each once however often it
// was reported, so that a run of changes costs one collection per object. Both directions are
// indexed: the answers cost the size of the answer and a logarithm, not the size of the drawing.
//
// Only objects of the public bases list references; any other object is known by its class alone.
class ZyrObjRelGraph : public HsDbDatabaseReactor {
public:
    // Learns every object the database holds now, and registers with it for what follows.
    explicit ZyrObjRelGraph(HsDbDatabase* database);
    ~ZyrObjRelGraph() override;
    ZyrObjRelGraph(const ZyrObjRelGraph&) = delete;
    ZyrObjRelGraph& operator=(const ZyrObjRelGraph&) = delete;

    HsDbDatabase* database() const { return m_database; }

    // Appends to ids the objects of a class, in the order of their handles. exactClassOnly:
    // objects of the class itself only, else of every class derived from it too. includeErased:
    // erased objects too. eNullPointer for a null class; ids is never cleared.
    Hsys::ErrorStatus getObjectsOfType(HsRxClass* cls, HsArray<HsDbObjectId>& ids,
                                       bool exactClassOnly, bool includeErased);
    // Appends to ids the objects that refer to object, in the order of their handles, and to
    // types the relation type of each (ZyrObjReferenceInfo::RelationType): an object that refers
    // in two ways stands twice, once per type, and one that refers twice in the same way once.
    // excludeErased: erased referring objects are left out. eNullPointer for null; eBadArgument
    // (nothing appended) for an object that is not in this database.
    Hsys::ErrorStatus getReferencesToMe(const HsDbObject* object, HsArray<HsDbObjectId>& ids,
                                        HsArray<int>& types, bool excludeErased);

    // Notes that the object's references (or its class) may have changed.
    void referencesModified(const HsDbObjectId& id);
    // The same on the graph of the object's database, when the service runs and has made one;
    // nothing otherwise (a graph made later learns the object then).
    static void noteReferencesModified(const HsDbObject* object);

    // The database's reports.
    void objectAppended(HsDbDatabase* database, HsDbObject* object) override;
    void databaseCleared(HsDbDatabase* database) override;
    void goodbye(HsDbDatabase* database) override;

private:
    using Incoming = std::set<std::pair<HsDbObjectId, int>>;
    struct Node {
        HsRxClass* cls = nullptr;
        // (referenced id, relation type), each pair once.
        std::vector<std::pair<HsDbObjectId, int>> references;
    };

    // Collects every reported object again.
    void refresh();
    void collect(const HsDbObjectId& id);
    void forget(const HsDbObjectId& id, const Node& node);
    void clear();

    HsDbDatabase* m_database;
    std::unordered_map<HsDbObjectId, Node> m_nodes;
    std::unordered_map<HsDbObjectId, Incoming> m_incoming;
    std::unordered_map<HsRxClass*, std::set<HsDbObjectId>> m_byClass;
    std::unordered_set<HsDbObjectId> m_stale;
};
