#include "platform/host/db/HsDbDictionary.h"

#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbNames.h"
#include "platform/host/db/HsDbRegistration.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>

HSRX_DEFINE_MEMBERS(HsDbDictionary, HsDbObject, 0, hsrxInstantiateClass<HsDbDictionary>)
HSDB_REGISTER_AT_LOAD(HsDbDictionary)

namespace {

bool isLive(const HsDbObjectId& id) {
    return !id.isErased();
}

} // namespace

const HsDbDictionary::Entry* HsDbDictionary::find(const wchar_t* name) const {
    if (name == nullptr)
        return nullptr;
    auto found = m_entries.find(hsdbFoldName(name));
    return found != m_entries.end() && isLive(found->second.id) ? &found->second : nullptr;
}

Hsys::ErrorStatus HsDbDictionary::getAt(const wchar_t* name, HsDbObjectId& id) const {
    if (name == nullptr)
        return Hsys::eNullPointer;
    const Entry* entry = find(name);
    if (entry == nullptr)
        return Hsys::eKeyNotFound;
    id = entry->id;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::getAt(const wchar_t* name, HsDbObject*& object,
                                        HsDb::OpenMode mode) const {
    object = nullptr;
    HsDbObjectId id;
    if (const Hsys::ErrorStatus status = getAt(name, id); status != Hsys::eSuccess)
        return status;
    return hsdbOpenObject(object, id, mode);
}

bool HsDbDictionary::has(const wchar_t* name) const {
    return find(name) != nullptr;
}

bool HsDbDictionary::has(const HsDbObjectId& id) const {
    std::wstring name;
    return nameAt(id, name) == Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::nameAt(const HsDbObjectId& id, std::wstring& name) const {
    if (id.isNull() || !isLive(id))
        return Hsys::eKeyNotFound;
    for (const auto& [folded, entry] : m_entries)
        if (entry.id == id) {
            name = entry.name;
            return Hsys::eSuccess;
        }
    return Hsys::eKeyNotFound;
}

int HsDbDictionary::numEntries() const {
    return static_cast<int>(std::count_if(m_entries.begin(), m_entries.end(),
                                          [](const auto& item) { return isLive(item.second.id); }));
}

std::vector<std::pair<std::wstring, HsDbObjectId>> HsDbDictionary::entries() const {
    std::vector<std::pair<std::wstring, HsDbObjectId>> live;
    for (const auto& [folded, entry] : m_entries)
        if (isLive(entry.id))
            live.emplace_back(entry.name, entry.id);
    return live;
}

Hsys::ErrorStatus HsDbDictionary::setAt(const wchar_t* name, HsDbObject* object, HsDbObjectId& id) {
    if (name == nullptr || *name == L'\0')
        return Hsys::eBadArgument;
    if (object == nullptr)
        return Hsys::eNullPointer;
    if (database() == nullptr)
        return Hsys::eNotInDatabase;
    if (object->database() != nullptr && object->database() != database())
        return Hsys::eBadArgument;
    if (has(name))
        return Hsys::eDuplicateName;
    assertWriteEnabled();
    HsDbObjectId entered = object->objectId();
    if (entered.isNull())
        if (const Hsys::ErrorStatus status = database()->addHsDbObject(entered, object);
            status != Hsys::eSuccess)
            return status;
    object->setOwnerId(objectId());
    m_entries[hsdbFoldName(name)] = Entry{name, entered};
    id = entered;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::remove(const wchar_t* name) {
    HsDbObjectId removed;
    return remove(name, removed);
}

Hsys::ErrorStatus HsDbDictionary::remove(const wchar_t* name, HsDbObjectId& id) {
    const Entry* entry = find(name);
    if (entry == nullptr)
        return Hsys::eKeyNotFound;
    assertWriteEnabled();
    id = entry->id;
    m_entries.erase(hsdbFoldName(name));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::setName(const wchar_t* oldName, const wchar_t* newName) {
    if (newName == nullptr || *newName == L'\0')
        return Hsys::eBadArgument;
    const Entry* entry = find(oldName);
    if (entry == nullptr)
        return Hsys::eKeyNotFound;
    const Entry* taken = find(newName);
    if (taken != nullptr && taken != entry)
        return Hsys::eDuplicateName;
    assertWriteEnabled();
    Entry renamed{newName, entry->id};
    m_entries.erase(hsdbFoldName(oldName));
    m_entries[hsdbFoldName(newName)] = std::move(renamed);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = HsDbObject::audit(info); status != Hsys::eSuccess)
        return status;
    for (auto it = m_entries.begin(); it != m_entries.end();) {
        if (it->second.id.isValid()) {
            ++it;
            continue;
        }
        info->printError(this, it->second.name.c_str(), L"names no object",
                         info->fixErrors() ? L"removed" : L"kept");
        info->errorsFound(1);
        if (!info->fixErrors()) {
            ++it;
            continue;
        }
        assertWriteEnabled();
        it = m_entries.erase(it);
        info->errorsFixed(1);
    }
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    std::uint32_t count = 0;
    if (filer->readUInt32(count) != Hsys::eSuccess)
        return filer->filerStatus();
    if (std::size_t{count} >
        filer->remaining() / (HsDbBdfFiler::kMinStringSize + HsDbBdfFiler::kIdSize)) {
        filer->setFilerStatus(Hsys::eFilerError);
        return filer->filerStatus();
    }
    Entries read;
    for (std::uint32_t i = 0; i < count; ++i) {
        Entry entry;
        if (filer->readString(entry.name) != Hsys::eSuccess ||
            filer->readHardOwnershipId(entry.id) != Hsys::eSuccess)
            return filer->filerStatus();
        if (entry.name.empty() || !read.emplace(hsdbFoldName(entry.name), entry).second) {
            filer->setFilerStatus(Hsys::eFilerError);
            return filer->filerStatus();
        }
    }
    m_entries = std::move(read);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDictionary::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeUInt32(static_cast<std::uint32_t>(m_entries.size()));
    for (const auto& [folded, entry] : m_entries) {
        filer->writeString(entry.name);
        filer->writeHardOwnershipId(entry.id);
    }
    return filer->filerStatus();
}
