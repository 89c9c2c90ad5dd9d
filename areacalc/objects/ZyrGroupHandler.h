// The public front of a group's membership, which callers reach through the group.
#pragma once

#include "areacalc/objects/ZyrGroupHandlerImp.h"

// Forwards everything to the handler implementation, which it does not own: the group's
// implementation object makes and deletes both. Statuses and rules are ZyrGroupHandlerImp's.
class ZyrGroupHandler {
public:
    using IdList = ZyrGroupHandlerImp::IdList;

    explicit ZyrGroupHandler(ZyrGroupHandlerImp& imp) : m_imp(imp) {}
    ZyrGroupHandler(const ZyrGroupHandler&) = delete;
    ZyrGroupHandler& operator=(const ZyrGroupHandler&) = delete;

    const ZyrGroupHandlerImp& imp() const { return m_imp; }

    // Each add tells the relationship graph.
    Hsys::ErrorStatus addNode(const HsDbObjectId& id) { return m_imp.addNode(id, true); }
    Hsys::ErrorStatus addLeaf(const HsDbObjectId& id) { return m_imp.addLeaf(id, true); }
    Hsys::ErrorStatus removeNode(const HsDbObjectId& id) { return m_imp.removeNode(id); }
    Hsys::ErrorStatus removeLeaf(const HsDbObjectId& id) { return m_imp.removeLeaf(id); }
    Hsys::ErrorStatus addNodes(const IdList& ids) { return m_imp.addNodes(ids); }
    Hsys::ErrorStatus addLeafs(const IdList& ids) { return m_imp.addLeafs(ids); }
    Hsys::ErrorStatus removeNodes(const IdList& ids) { return m_imp.removeNodes(ids); }
    Hsys::ErrorStatus removeLeafs(const IdList& ids) { return m_imp.removeLeafs(ids); }

    const IdList& nodes() const { return m_imp.nodes(); }
    const IdList& leafs() const { return m_imp.leafs(); }
    unsigned short nodeOwnership() const { return m_imp.nodeOwnership(); }
    Hsys::ErrorStatus setNodeOwnership(unsigned short mode) { return m_imp.setNodeOwnership(mode); }

    bool has(const HsDbObjectId& id) const { return m_imp.has(id); }
    bool hasNode(const HsDbObjectId& id) const { return m_imp.hasNode(id); }
    bool hasLeaf(const HsDbObjectId& id) const { return m_imp.hasLeaf(id); }
    Hsys::ErrorStatus nodes(IdList& out) const { return m_imp.nodes(out); }
    Hsys::ErrorStatus leafs(IdList& out) const { return m_imp.leafs(out); }
    Hsys::ErrorStatus childs(IdList& out) const { return m_imp.childs(out); }

private:
    ZyrGroupHandlerImp& m_imp;
};
