#include "platform/host/db/HsDbSymbolTable.h"

#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbNames.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutFormat.h"

HSRX_DEFINE_MEMBERS(HsDbSymbolTableRecord, HsDbObject, 0, nullptr)
HSRX_DEFINE_MEMBERS(HsDbSymbolTable, HsDbObject, 0, nullptr)

Hsys::ErrorStatus HsDbSymbolTableRecord::getName(const wchar_t*& name) const {
    name = m_name.c_str();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbSymbolTableRecord::setName(const wchar_t* name) {
    if (name == nullptr || *name == L'\0')
        return Hsys::eBadArgument;
    const HsDbObjectId owner = ownerId();
    const HsDbSymbolTable* table =
        owner.isValid() ? HsDbSymbolTable::cast(owner.entry()->object) : nullptr;
    const HsDbSymbolTableRecord* taken = table != nullptr ? table->find(name) : nullptr;
    if (taken != nullptr && taken != this)
        return Hsys::eDuplicateName;
    assertWriteEnabled();
    m_name = name;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbSymbolTableRecord::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    std::wstring name;
    if (filer->readString(name) != Hsys::eSuccess)
        return filer->filerStatus();
    if (name.empty()) {
        filer->setFilerStatus(Hsys::eFilerError);
        return filer->filerStatus();
    }
    m_name = std::move(name);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbSymbolTableRecord::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeString(m_name);
    return filer->filerStatus();
}

const HsDbSymbolTableRecord* HsDbSymbolTable::find(std::wstring_view name) const {
    for (const HsDbObjectId& id : m_records) {
        if (!id.isValid() || id.isErased())
            continue;
        const auto* record = HsDbSymbolTableRecord::cast(id.entry()->object);
        if (record != nullptr && hsdbNamesEqual(record->name(), name))
            return record;
    }
    return nullptr;
}

Hsys::ErrorStatus HsDbSymbolTable::getAt(const wchar_t* name, HsDbObjectId& id) const {
    if (name == nullptr)
        return Hsys::eNullPointer;
    const HsDbSymbolTableRecord* record = find(name);
    if (record == nullptr)
        return Hsys::eKeyNotFound;
    id = record->objectId();
    return Hsys::eSuccess;
}

bool HsDbSymbolTable::has(const wchar_t* name) const {
    return name != nullptr && find(name) != nullptr;
}

Hsys::ErrorStatus HsDbSymbolTable::add(HsDbObjectId& id, HsDbSymbolTableRecord* record) {
    if (record == nullptr)
        return Hsys::eNullPointer;
    if (!record->isKindOf(recordClass()))
        return Hsys::eWrongClass;
    if (record->name().empty())
        return Hsys::eBadArgument;
    if (find(record->name()) != nullptr)
        return Hsys::eDuplicateName;
    if (record->database() != nullptr)
        return Hsys::eAlreadyPresent;
    if (database() == nullptr)
        return Hsys::eNotInDatabase;
    assertWriteEnabled();
    HsDbObjectId added;
    if (const Hsys::ErrorStatus status = database()->addHsDbObject(added, record);
        status != Hsys::eSuccess)
        return status;
    record->setOwnerId(objectId());
    m_records.push_back(added);
    id = added;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbSymbolTable::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = HsDbObject::audit(info); status != Hsys::eSuccess)
        return status;
    hsdbAuditOwnedIds(this, info, m_records, L"record");
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbSymbolTable::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    return HsDbFilerSupport::bdfReadHardPointerVector(filer, m_records, true);
}

Hsys::ErrorStatus HsDbSymbolTable::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return HsDbFilerSupport::bdfWriteHardPointerVector(filer, m_records);
}

void hsdbAuditOwnedIds(HsDbObject* owner, HsDbAuditInfo* info, std::vector<HsDbObjectId>& ids,
                       const wchar_t* role) {
    for (auto it = ids.begin(); it != ids.end();) {
        if (it->isValid()) {
            ++it;
            continue;
        }
        const std::wstring value =
            hsutFormat(L"%s %llu", role, static_cast<unsigned long long>(it->handle()));
        info->printError(owner, value.c_str(), L"has no object",
                         info->fixErrors() ? L"removed" : L"kept");
        info->errorsFound(1);
        if (!info->fixErrors()) {
            ++it;
            continue;
        }
        owner->assertWriteEnabled();
        it = ids.erase(it);
        info->errorsFixed(1);
    }
}
