#include "areacalc/objects/ZyrGroupHandlerImp.h"

#include "areacalc/objects/ZyrWriteToRead.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <utility>

namespace {

bool contains(const ZyrGroupHandlerImp::IdList& list, const HsDbObjectId& id) {
    return std::find(list.begin(), list.end(), id) != list.end();
}

// Only the very class passes: a class derived from it does not.
bool isOfClass(const HsDbObjectId& id, const HsRxClass* cls) {
    const HsRxClass* objectClass = id.objectClass();
    return objectClass != nullptr && objectClass->comparedTo(cls) == HsRx::eEqual;
}

} // namespace

ZyrGroupHandlerImp::ZyrGroupHandlerImp(ZyrImpGeo* parent, HsRxClass* nodeClass,
                                       HsRxClass* leafClass)
    : m_parent(parent), m_nodeClass(nodeClass), m_leafClass(leafClass) {}

ZyrGroupHandlerImp::~ZyrGroupHandlerImp() = default;

Hsys::ErrorStatus ZyrGroupHandlerImp::addNode(const HsDbObjectId& id, bool record) {
    HsDbObject* group = dbParent();
    bool ofNodeClass = false;
    {
        // As around every question about another object, the group is open for read at most.
        const ZyrWriteToRead readOnly(group);
        if ((m_ownership & ZyrGroupNodeTypes::kNodeOwner) == 0)
            return Hsys::eNullPointer;
        ofNodeClass = isOfClass(id, m_nodeClass);
    }
    if (group == nullptr || !ofNodeClass)
        return Hsys::eNullPointer;
    if (id == group->objectId())
        return Hsys::eSelfReference;
    if (contains(m_nodes, id))
        return Hsys::eAlreadyPresent;
    try {
        if (isContainedBy(id))
            return Hsys::eDoesNotApply;
        addItem(id, m_nodes, record);
        return Hsys::eSuccess;
    } catch (...) {
        return Hsys::eDoesNotApply;
    }
}

Hsys::ErrorStatus ZyrGroupHandlerImp::addLeaf(const HsDbObjectId& id, bool record) {
    if ((m_ownership & ZyrGroupNodeTypes::kLeafOwner) == 0 || !isOfClass(id, m_leafClass))
        return Hsys::eDoesNotApply;
    if (contains(m_leafs, id))
        return Hsys::eAlreadyPresent;
    addItem(id, m_leafs, record);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrGroupHandlerImp::addNodes(const IdList& ids) {
    return addAll(ids, &ZyrGroupHandlerImp::addNode);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::addLeafs(const IdList& ids) {
    return addAll(ids, &ZyrGroupHandlerImp::addLeaf);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::addAll(const IdList& ids, AddOne add) {
    bool added = false;
    for (const HsDbObjectId& id : ids)
        added = (this->*add)(id, false) == Hsys::eSuccess || added;
    if (!added)
        return Hsys::eDoesNotApply;
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrGroupHandlerImp::removeNodes(const IdList& ids) {
    return removeAll(ids, m_nodes);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::removeLeafs(const IdList& ids) {
    return removeAll(ids, m_leafs);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::removeAll(const IdList& ids, IdList& list) {
    return removeItems(ids, list) > 0 ? Hsys::eSuccess : Hsys::eDoesNotApply;
}

Hsys::ErrorStatus ZyrGroupHandlerImp::setNodeOwnership(unsigned short mode) {
    if (mode > ZyrGroupNodeTypes::kHighestMode)
        return Hsys::eDoesNotApply;
    if (mode == m_ownership)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_ownership = mode;
    return Hsys::eSuccess;
}

bool ZyrGroupHandlerImp::has(const HsDbObjectId& id) const {
    return hasLeaf(id) || hasNode(id);
}

bool ZyrGroupHandlerImp::hasNode(const HsDbObjectId& id) const {
    return hasInTree(id, &ZyrGroupHandlerImp::nodes);
}

bool ZyrGroupHandlerImp::hasLeaf(const HsDbObjectId& id) const {
    return hasInTree(id, &ZyrGroupHandlerImp::leafs);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::nodes(IdList& out) const {
    return collectInTree(out, &ZyrGroupHandlerImp::nodes);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::leafs(IdList& out) const {
    if (ownObjectId().isNull())
        return Hsys::eSuccess;
    return collectInTree(out, &ZyrGroupHandlerImp::leafs);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::childs(IdList& out) const {
    const Hsys::ErrorStatus nodesStatus = nodes(out);
    const Hsys::ErrorStatus leafsStatus = leafs(out);
    return nodesStatus != Hsys::eSuccess ? nodesStatus : leafsStatus;
}

Hsys::ErrorStatus ZyrGroupHandlerImp::copyFrom(const ZyrGroupHandlerImp& other) {
    if (other.m_leafClass != m_leafClass || other.m_nodeClass != m_nodeClass)
        return Hsys::eDoesNotApply;
    if (&other == this)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_nodes = other.m_nodes;
    m_leafs = other.m_leafs;
    m_ownership = other.m_ownership;
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

void ZyrGroupHandlerImp::replaceLists(IdList nodes, IdList leafs) {
    assertParentWriteEnabled();
    m_nodes = std::move(nodes);
    m_leafs = std::move(leafs);
    recordParentReferencesModified();
}

Hsys::ErrorStatus ZyrGroupHandlerImp::getReferencedObjects(ZyrObjReferenceMap& map) const {
    constexpr int kMember = ZyrObjReferenceInfo::kMemberRelation;
    const int leafExportClone = map.context() == ZyrObjReferenceMap::kSelectionCopyContext ? 1 : 0;
    for (const HsDbObjectId& leaf : m_leafs)
        map.addReferenceInfo(new ZyrObjReferenceInfo(leaf, kMember, 0, leafExportClone));
    for (const HsDbObjectId& node : m_nodes)
        map.addReferenceInfo(new ZyrObjReferenceInfo(node, kMember, 1, 1));
    return Hsys::eSuccess;
}

bool ZyrGroupHandlerImp::isContainedBy(const HsDbObjectId& id) const {
    HsDbObject* group = dbParent();
    if (group == nullptr)
        return false;
    const HsDbObjectId own = group->objectId();
    if (id == own || !isOfClass(id, m_nodeClass))
        return false;
    // The walk below id comes back to this group and opens it for read.
    const ZyrWriteToRead readOnly(group);
    return handlerById(id).hasNode(own);
}

Hsys::ErrorStatus ZyrGroupHandlerImp::bdfOutFields(HsDbBdfFiler* filer) const {
    HsDbFilerSupport::bdfWriteSoftPointerVector(filer, m_leafs);
    HsDbFilerSupport::bdfWriteHardPointerVector(filer, m_nodes);
    filer->writeUInt16(m_ownership);
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrGroupHandlerImp::bdfInFields(HsDbBdfFiler* filer) {
    IdList leafs;
    IdList nodes;
    std::uint16_t ownership = 0;
    if (HsDbFilerSupport::bdfReadSoftPointerVector(filer, leafs, true) != Hsys::eSuccess ||
        HsDbFilerSupport::bdfReadHardPointerVector(filer, nodes, true) != Hsys::eSuccess ||
        filer->readUInt16(ownership) != Hsys::eSuccess)
        return filer->filerStatus();
    m_leafs = std::move(leafs);
    m_nodes = std::move(nodes);
    m_ownership = ownership;
    return Hsys::eSuccess;
}

HsDbObject* ZyrGroupHandlerImp::dbParent() const {
    return m_parent != nullptr ? m_parent->dbParent() : nullptr;
}

HsDbObjectId ZyrGroupHandlerImp::ownObjectId() const {
    const HsDbObject* group = dbParent();
    return group != nullptr ? group->objectId() : HsDbObjectId();
}

void ZyrGroupHandlerImp::addItem(const HsDbObjectId& id, IdList& list, bool record) {
    assertParentWriteEnabled();
    list.push_back(id);
    if (record)
        recordParentReferencesModified();
}

Hsys::ErrorStatus ZyrGroupHandlerImp::removeItem(const HsDbObjectId& id, IdList& list) {
    const auto found = std::find(list.begin(), list.end(), id);
    if (found == list.end())
        return Hsys::eDoesNotApply;
    assertParentWriteEnabled();
    list.erase(found);
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

std::size_t ZyrGroupHandlerImp::removeItems(const IdList& ids, IdList& list) {
    if (ids.empty())
        return 0;
    IdList kept;
    std::copy_if(list.begin(), list.end(), std::back_inserter(kept),
                 [&](const HsDbObjectId& item) { return !contains(ids, item); });
    const std::size_t removed = list.size() - kept.size();
    assertParentWriteEnabled();
    list.swap(kept);
    recordParentReferencesModified();
    return removed;
}

bool ZyrGroupHandlerImp::hasChild(const ZyrGroupHandlerImp& handler, const HsDbObjectId& id,
                                  ListAccessor list) const {
    if (contains((handler.*list)(), id))
        return true;
    for (const HsDbObjectId& node : handler.m_nodes)
        if (!node.isErased() && hasChild(handler.handlerById(node), id, list))
            return true;
    return false;
}

void ZyrGroupHandlerImp::collectChild(const ZyrGroupHandlerImp& handler, IdList& out,
                                      ListAccessor list) const {
    const IdList& items = (handler.*list)();
    out.insert(out.end(), items.begin(), items.end());
    for (const HsDbObjectId& node : handler.m_nodes)
        if (!node.isErased())
            collectChild(handler.handlerById(node), out, list);
}

bool ZyrGroupHandlerImp::hasInTree(const HsDbObjectId& id, ListAccessor list) const {
    try {
        return hasChild(handlerById(ownObjectId()), id, list);
    } catch (...) {
        return false;
    }
}

Hsys::ErrorStatus ZyrGroupHandlerImp::collectInTree(IdList& out, ListAccessor list) const {
    try {
        collectChild(handlerById(ownObjectId()), out, list);
        return Hsys::eSuccess;
    } catch (...) {
        return Hsys::eDoesNotApply;
    }
}

void ZyrGroupHandlerImp::assertParentWriteEnabled() {
    if (m_parent != nullptr)
        m_parent->assertParentWriteEnabled(true, true);
}

void ZyrGroupHandlerImp::recordParentReferencesModified() {
    if (m_parent != nullptr)
        m_parent->recordParentReferencesModified();
}
