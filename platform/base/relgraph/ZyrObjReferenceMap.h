// The references an object lists when asked (getReferencedObjects), for the relationship graph,
// audits and copies.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <memory>
#include <vector>

class ZyrObjReferenceInfo;

// The context tells an object what the list is for, when that changes what it lists: 0 for the
// relationship graph and audits; a copy of a selection passes kSelectionCopyContext, in which a
// group takes its areas along.
class ZyrObjReferenceMap {
public:
    static constexpr int kRelationContext = 0;
    static constexpr int kSelectionCopyContext = 3;

    explicit ZyrObjReferenceMap(int context = kRelationContext);
    ~ZyrObjReferenceMap();
    ZyrObjReferenceMap(const ZyrObjReferenceMap&) = delete;
    ZyrObjReferenceMap& operator=(const ZyrObjReferenceMap&) = delete;

    int context() const { return m_context; }

    // A style or record that the object uses: a reference of kRecordRelation that goes along
    // with neither a copy nor an export. A null id refers to nothing: eNullId, nothing added.
    Hsys::ErrorStatus addRecordReference(const HsDbObjectId& id);
    // Takes ownership. eNullPointer for null; eNullId, with the info deleted, for a null id.
    Hsys::ErrorStatus addReferenceInfo(ZyrObjReferenceInfo* info);

    // In the order of adding; the same id may stand more than once.
    int count() const { return static_cast<int>(m_references.size()); }
    // Null outside [0, count()).
    const ZyrObjReferenceInfo* at(int index) const;

private:
    int m_context;
    std::vector<std::unique_ptr<ZyrObjReferenceInfo>> m_references;
};
