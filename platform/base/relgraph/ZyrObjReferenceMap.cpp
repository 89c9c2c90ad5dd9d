#include "platform/base/relgraph/ZyrObjReferenceMap.h"

#include "platform/base/relgraph/ZyrObjReferenceInfo.h"

ZyrObjReferenceMap::ZyrObjReferenceMap(int context) : m_context(context) {}

ZyrObjReferenceMap::~ZyrObjReferenceMap() = default;

Hsys::ErrorStatus ZyrObjReferenceMap::addRecordReference(const HsDbObjectId& id) {
    return addReferenceInfo(
        new ZyrObjReferenceInfo(id, ZyrObjReferenceInfo::kRecordRelation, 0, 0));
}

Hsys::ErrorStatus ZyrObjReferenceMap::addReferenceInfo(ZyrObjReferenceInfo* info) {
    if (info == nullptr)
        return Hsys::eNullPointer;
    std::unique_ptr<ZyrObjReferenceInfo> owned(info);
    if (owned->id().isNull())
        return Hsys::eNullId;
    m_references.push_back(std::move(owned));
    return Hsys::eSuccess;
}

const ZyrObjReferenceInfo* ZyrObjReferenceMap::at(int index) const {
    if (index < 0 || index >= count())
        return nullptr;
    return m_references[static_cast<std::size_t>(index)].get();
}
