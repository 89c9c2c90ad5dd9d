// The membership of one group: its child groups (nodes), its member areas (leafs), the ownership
// mode, and every rule of what may be added and how the tree below the group is asked.
#pragma once

#include "areacalc/objects/ZyrGroupNodeTypes.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstddef>
#include <vector>

class HsDbBdfFiler;
class HsDbObject;
class HsRxClass;
class ZyrImpGeo;
class ZyrObjReferenceMap;

// A link is stored on the parent's side only: a member has no pointer to the groups that hold it.
// The way back is asked of the drawing's relationship graph, which follows because every change of
// a list ends in recordParentReferencesModified() on the group that holds the handler.
//
// The handler belongs to the implementation object of its group (the parent), which is not owned
// and through which every change asserts write. A handler reaches the handlers of the groups below
// it through handlerById, which a derived class gives for its group class. Walks over the tree
// open groups for read; a group that cannot be opened ends the process (see
// ZyrStandardGroupHandlerImp), so walkers skip erased ids first. Nothing guards a walk against a
// cycle: addNode refuses every link that would close one, at any depth.
class ZyrGroupHandlerImp {
public:
    using IdList = std::vector<HsDbObjectId>;

    // nodeClass and leafClass: the very classes that nodes and leafs must have.
    ZyrGroupHandlerImp(ZyrImpGeo* parent, HsRxClass* nodeClass, HsRxClass* leafClass);
    ZyrGroupHandlerImp(const ZyrGroupHandlerImp&) = delete;
    ZyrGroupHandlerImp& operator=(const ZyrGroupHandlerImp&) = delete;

    // The virtual operations, in the order of their slots.
    virtual ~ZyrGroupHandlerImp();
    // The handler of the group behind id; this handler for the id of its own group.
    virtual const ZyrGroupHandlerImp& handlerById(const HsDbObjectId& id) const = 0;

    // Refusals, in this order: eNullPointer when the mode has no kNodeOwner bit, the handler has no
    // group, or id is not of the very node class; eSelfReference for the group's own id;
    // eAlreadyPresent for a direct node; eDoesNotApply when the group lies below id already (a
    // cycle), or when the check or the add throws. record: tell the relationship graph.
    Hsys::ErrorStatus addNode(const HsDbObjectId& id, bool record);
    // eDoesNotApply when the mode has no kLeafOwner bit or id is not of the very leaf class;
    // eAlreadyPresent for a direct leaf. Other groups holding the leaf do not matter.
    Hsys::ErrorStatus addLeaf(const HsDbObjectId& id, bool record);
    // Each id through addNode (addLeaf) without recording; refusals do not stop the run. The graph
    // is told once. eDoesNotApply for no ids or when none was added: a partial success succeeds.
    Hsys::ErrorStatus addNodes(const IdList& ids);
    Hsys::ErrorStatus addLeafs(const IdList& ids);
    // The first occurrence goes, the rest keep their order. eDoesNotApply when id is not listed.
    Hsys::ErrorStatus removeNode(const HsDbObjectId& id) { return removeItem(id, m_nodes); }
    Hsys::ErrorStatus removeLeaf(const HsDbObjectId& id) { return removeItem(id, m_leafs); }
    // Every occurrence of the ids goes. eDoesNotApply when none went; the graph is told all the
    // same, unless ids is empty.
    Hsys::ErrorStatus removeNodes(const IdList& ids);
    Hsys::ErrorStatus removeLeafs(const IdList& ids);

    // The direct members in the order of addition, erased ids included.
    const IdList& nodes() const { return m_nodes; }
    const IdList& leafs() const { return m_leafs; }

    unsigned short nodeOwnership() const { return m_ownership; }
    // eDoesNotApply above ZyrGroupNodeTypes::kHighestMode. Members held already stay, and the
    // graph is not told: the mode refers to nothing.
    Hsys::ErrorStatus setNodeOwnership(unsigned short mode);

    // hasLeaf, then hasNode.
    bool has(const HsDbObjectId& id) const;
    // Whether id stands in a node (leaf) list anywhere in the tree below the group. Erased groups
    // are not descended into. False when the walk throws.
    bool hasNode(const HsDbObjectId& id) const;
    bool hasLeaf(const HsDbObjectId& id) const;
    // Appends the nodes (leafs) of the whole tree below the group, depth first, each group's list
    // before the lists below it; erased ids go along but are not descended into. eDoesNotApply when
    // the walk throws. leafs appends nothing for a group that is in no database.
    Hsys::ErrorStatus nodes(IdList& out) const;
    Hsys::ErrorStatus leafs(IdList& out) const;
    // nodes(out), then leafs(out), both always; the first failure.
    Hsys::ErrorStatus childs(IdList& out) const;

    // Lists and mode of a handler for the same classes; eDoesNotApply for other classes.
    Hsys::ErrorStatus copyFrom(const ZyrGroupHandlerImp& other);
    // Both lists as an old stream of the group gave them, without the checks of the adds; the mode
    // stays. Asserts write and tells the relationship graph, as every change of a list does.
    void replaceLists(IdList nodes, IdList leafs);
    // Leafs, then nodes, as member relations. A copy takes the child groups along in both roles; an
    // export takes the areas along only in a selection copy's context.
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const;
    // Whether the group of this handler lies in the tree below the group id.
    bool isContainedBy(const HsDbObjectId& id) const;

    // The handler's part of its group's filing: the leafs as soft pointers, the nodes as hard
    // pointers, the mode as uint16. A reader stores the mode as read, and changes nothing unless
    // all three were read.
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer);

    ZyrImpGeo* parent() const { return m_parent; }
    // The public object of the parent, or null.
    HsDbObject* dbParent() const;
    // Its id; null while it is in no database or there is none.
    HsDbObjectId ownObjectId() const;
    HsRxClass* nodeClass() const { return m_nodeClass; }
    HsRxClass* leafClass() const { return m_leafClass; }

protected:
    // Picks the list of a handler that a walk looks at.
    using ListAccessor = const IdList& (ZyrGroupHandlerImp::*)() const;

    // Asserts write before and records after appending, so that the graph sees the new list.
    void addItem(const HsDbObjectId& id, IdList& list, bool record);
    Hsys::ErrorStatus removeItem(const HsDbObjectId& id, IdList& list);
    // How many went.
    std::size_t removeItems(const IdList& ids, IdList& list);
    bool hasChild(const ZyrGroupHandlerImp& handler, const HsDbObjectId& id,
                  ListAccessor list) const;
    void collectChild(const ZyrGroupHandlerImp& handler, IdList& out, ListAccessor list) const;

private:
    using AddOne = Hsys::ErrorStatus (ZyrGroupHandlerImp::*)(const HsDbObjectId&, bool);

    Hsys::ErrorStatus addAll(const IdList& ids, AddOne add);
    Hsys::ErrorStatus removeAll(const IdList& ids, IdList& list);
    bool hasInTree(const HsDbObjectId& id, ListAccessor list) const;
    Hsys::ErrorStatus collectInTree(IdList& out, ListAccessor list) const;
    void assertParentWriteEnabled();
    void recordParentReferencesModified();

    IdList m_nodes;
    IdList m_leafs;
    unsigned short m_ownership = ZyrGroupNodeTypes::kNodeAndLeafOwner;
    ZyrImpGeo* m_parent;
    HsRxClass* m_nodeClass;
    HsRxClass* m_leafClass;
};
