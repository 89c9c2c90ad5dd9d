#include "platform/host/db/HsDbBlockTable.h"

#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbEntity.h"
#include "platform/host/db/HsDbRegistration.h"
#include "platform/host/filer/HsDbFilerSupport.h"

HSRX_DEFINE_MEMBERS(HsDbBlockTableRecord, HsDbSymbolTableRecord, 0,
                    hsrxInstantiateClass<HsDbBlockTableRecord>)
HSRX_DEFINE_MEMBERS(HsDbBlockTable, HsDbSymbolTable, 0, hsrxInstantiateClass<HsDbBlockTable>)
HSDB_REGISTER_AT_LOAD(HsDbBlockTableRecord)
HSDB_REGISTER_AT_LOAD(HsDbBlockTable)

HsRxClass* HsDbBlockTable::recordClass() const {
    return HsDbBlockTableRecord::desc();
}

Hsys::ErrorStatus HsDbBlockTableRecord::appendHsDbEntity(HsDbObjectId& id, HsDbEntity* entity) {
    if (entity == nullptr)
        return Hsys::eNullPointer;
    if (entity->database() != nullptr)
        return Hsys::eAlreadyPresent;
    if (database() == nullptr)
        return Hsys::eNotInDatabase;
    assertWriteEnabled();
    HsDbObjectId appended;
    if (const Hsys::ErrorStatus status = database()->addHsDbObject(appended, entity);
        status != Hsys::eSuccess)
        return status;
    entity->setOwnerId(objectId());
    m_entities.push_back(appended);
    id = appended;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBlockTableRecord::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = HsDbSymbolTableRecord::audit(info);
        status != Hsys::eSuccess)
        return status;
    hsdbAuditOwnedIds(this, info, m_entities, L"entity");
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBlockTableRecord::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbSymbolTableRecord::bdfInFields(filer);
        status != Hsys::eSuccess)
        return status;
    return HsDbFilerSupport::bdfReadHardPointerVector(filer, m_entities, true);
}

Hsys::ErrorStatus HsDbBlockTableRecord::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbSymbolTableRecord::bdfOutFields(filer);
        status != Hsys::eSuccess)
        return status;
    return HsDbFilerSupport::bdfWriteHardPointerVector(filer, m_entities);
}
