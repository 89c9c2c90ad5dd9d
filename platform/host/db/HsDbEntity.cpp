#include "platform/host/db/HsDbEntity.h"

#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutFormat.h"

HSRX_DEFINE_MEMBERS(HsDbEntity, HsDbObject, 0, nullptr)

namespace {

constexpr int kLayerGroupCode = 347;

bool isLayer(const HsDbObjectId& id) {
    const HsRxClass* cls = id.objectClass();
    return cls != nullptr && cls->isDerivedFrom(HsDbLayerTableRecord::desc());
}

} // namespace

void HsDbEntity::setDatabaseDefaults(HsDbDatabase* database) {
    subSetDatabaseDefaults(database != nullptr ? database
                                               : hsdbHostApplicationServices()->workingDatabase());
}

void HsDbEntity::subSetDatabaseDefaults(HsDbDatabase* database) {
    HsDbObject::subSetDatabaseDefaults(database);
    if (database != nullptr && m_layerId.isNull() && !database->currentLayerId().isNull()) {
        assertWriteEnabled();
        m_layerId = database->currentLayerId();
    }
}

HsDbObjectId HsDbEntity::layerId() const {
    return m_layerId;
}

Hsys::ErrorStatus HsDbEntity::setLayer(const HsDbObjectId& layerId) {
    if (layerId.isNull())
        return Hsys::eNullId;
    if (!isLayer(layerId))
        return Hsys::eWrongClass;
    if (layerId == m_layerId)
        return Hsys::eSuccess;
    assertWriteEnabled();
    m_layerId = layerId;
    return Hsys::eSuccess;
}

HsDbObjectId HsDbEntity::blockId() const {
    const HsRxClass* ownerClass = ownerId().objectClass();
    return ownerClass != nullptr && ownerClass->isDerivedFrom(HsDbBlockTableRecord::desc())
               ? ownerId()
               : HsDbObjectId();
}

Hsys::ErrorStatus HsDbEntity::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = HsDbObject::audit(info); status != Hsys::eSuccess)
        return status;
    if (isLayer(m_layerId) || database() == nullptr)
        return Hsys::eSuccess;
    const HsDbObjectId current = database()->currentLayerId();
    const std::wstring value =
        hsutFormat(L"layer %llu", static_cast<unsigned long long>(m_layerId.handle()));
    info->printError(this, value.c_str(), L"is no layer",
                     info->fixErrors() ? L"set to the current layer" : L"kept");
    info->errorsFound(1);
    if (info->fixErrors() && isLayer(current)) {
        assertWriteEnabled();
        m_layerId = current;
        info->errorsFixed(1);
    }
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbEntity::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    HsDbObjectId layer;
    if (filer->readHardPointerId(layer) == Hsys::eSuccess)
        m_layerId = layer;
    return filer->filerStatus();
}

Hsys::ErrorStatus HsDbEntity::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeHardPointerId(m_layerId);
    return filer->filerStatus();
}

Hsys::ErrorStatus HsDbEntity::tdfInFields(HsDbTdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::tdfInFields(filer); status != Hsys::eSuccess)
        return status;
    return filer->readObjectIdItem(kLayerGroupCode, m_layerId);
}

Hsys::ErrorStatus HsDbEntity::tdfOutFields(HsDbTdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::tdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeItem(HsDbTdfItem(kLayerGroupCode, m_layerId));
    return filer->filerStatus();
}
