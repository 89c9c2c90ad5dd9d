#include "platform/base/obj/ZyrImpArray.h"

#include "platform/base/obj/ZyrFiling.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/base/zyrtl/zyrtlDelete.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>
#include <memory>

HSRX_DEFINE_MEMBERS(ZyrImpArray, ZyrImpObj, 0, hsrxInstantiateClass<ZyrImpArray>)

namespace {

using OwnedEntries = std::vector<std::unique_ptr<ZyrImpObj>>;

Hsys::ErrorStatus failTdf(HsDbTdfFiler* filer, const wchar_t* message) {
    filer->setError(Hsys::eBadTdfSequence, message);
    return Hsys::eBadTdfSequence;
}

// The next item, which must have the group code and hold a value of the asked kind.
template <class Value, class Getter>
Hsys::ErrorStatus readTdfValue(HsDbTdfFiler* filer, int groupCode, Getter getter, Value& value,
                               const wchar_t* what) {
    HsDbTdfItem item;
    if (const Hsys::ErrorStatus status = filer->readItem(item); status != Hsys::eSuccess)
        return status == Hsys::eEndOfInput ? failTdf(filer, what) : status;
    if (item.groupCode() != groupCode || (item.*getter)(value) != Hsys::eSuccess)
        return failTdf(filer, what);
    return Hsys::eSuccess;
}

} // namespace

ZyrImpArray::ZyrImpArray() = default;

ZyrImpArray::~ZyrImpArray() {
    zyrtl::deleteItems(m_entries);
}

Hsys::ErrorStatus ZyrImpArray::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpObj::copyFrom(other); status != Hsys::eSuccess)
        return status;
    const ZyrImpArray* source = ZyrImpArray::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    OwnedEntries copies;
    copies.reserve(source->m_entries.size());
    for (const ZyrImpObj* entry : source->m_entries) {
        copies.emplace_back(ZyrImpObj::cast(entry->clone()));
        if (copies.back() == nullptr)
            return Hsys::eBadArgument;
    }
    assertParentWriteEnabled();
    replaceEntries(zyrtl::releaseAll(copies));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArray::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrImpArray::desc(), [&] { return ZyrImpObj::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, [&] { return bdfInOwnFields(filer); });
}

Hsys::ErrorStatus ZyrImpArray::bdfInOwnFields(HsDbBdfFiler* filer) {
    OwnedEntries read;
    if (const Hsys::ErrorStatus status = Zyr::readObjectList(
            filer, this, static_cast<unsigned short>(filedVersion()), read);
        status != Hsys::eSuccess)
        return status;
    replaceEntries(zyrtl::releaseAll(read));
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpArray::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrImpObj::bdfOutFields(filer); }, [&] { return bdfOutVersion(filer); },
        [&] { return bdfOutOwnFields(filer); });
}

Hsys::ErrorStatus ZyrImpArray::bdfOutOwnFields(HsDbBdfFiler* filer) const {
    filer->writeUInt32(static_cast<std::uint32_t>(m_entries.size()));
    for (const ZyrImpObj* entry : m_entries)
        if (const Hsys::ErrorStatus status =
                Zyr::writeObject(filer, entry, static_cast<unsigned short>(Zyr::kCurrentVersion));
            status != Hsys::eSuccess)
            return status;
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpArray::tdfInFields(HsDbTdfFiler* filer) {
    if (const Hsys::ErrorStatus status = ZyrImpObj::tdfInFields(filer); status != Hsys::eSuccess)
        return status;
    std::wstring control;
    if (const Hsys::ErrorStatus status =
            readTdfValue(filer, kControlGroupCode, &HsDbTdfItem::getText, control,
                         L"an array lacks its control string");
        status != Hsys::eSuccess)
        return status;
    if (control != m_controlString.str())
        return failTdf(filer, L"an array has the control string of another array");
    std::int32_t count = 0;
    if (const Hsys::ErrorStatus status = readTdfValue(
            filer, kCountGroupCode, &HsDbTdfItem::getInteger, count, L"an array lacks its count");
        status != Hsys::eSuccess)
        return status;
    if (count < 0 || static_cast<std::size_t>(count) > filer->items().size() - filer->position())
        return failTdf(filer, L"an array's count is more than the items that follow");
    OwnedEntries read;
    for (std::int32_t i = 0; i < count; ++i) {
        ZyrImpObj* entry = nullptr;
        if (const Hsys::ErrorStatus status = readTdfEntry(filer, entry); status != Hsys::eSuccess)
            return status;
        read.emplace_back(entry);
    }
    replaceEntries(zyrtl::releaseAll(read));
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpArray::readTdfEntry(HsDbTdfFiler* filer, ZyrImpObj*& entry) {
    std::wstring className;
    if (const Hsys::ErrorStatus status =
            readTdfValue(filer, kClassGroupCode, &HsDbTdfItem::getText, className,
                         L"an array entry lacks its class name");
        status != Hsys::eSuccess)
        return status;
    std::unique_ptr<ZyrImpObj> read(Zyr::newImpObject(hsrxFindHsRxClass(className.c_str())));
    if (read == nullptr)
        return failTdf(filer, L"an array entry names no implementation class");
    read->setParent(this);
    if (const Hsys::ErrorStatus status = read->tdfInFields(filer); status != Hsys::eSuccess)
        return status;
    entry = read.release();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArray::tdfOutFields(HsDbTdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = ZyrImpObj::tdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeItem(HsDbTdfItem(kControlGroupCode, m_controlString.str()));
    filer->writeItem(HsDbTdfItem(kCountGroupCode, static_cast<std::int32_t>(m_entries.size())));
    for (const ZyrImpObj* entry : m_entries) {
        filer->writeItem(HsDbTdfItem(kClassGroupCode, entry->isA()->name()));
        if (const Hsys::ErrorStatus status = entry->tdfOutFields(filer); status != Hsys::eSuccess)
            return status;
    }
    return filer->filerStatus();
}

template <class Operation> Hsys::ErrorStatus ZyrImpArray::forEachEntry(Operation operation) const {
    Hsys::ErrorStatus result = Hsys::eSuccess;
    for (ZyrImpObj* entry : m_entries)
        if (const Hsys::ErrorStatus status = operation(*entry); result == Hsys::eSuccess)
            result = status;
    return result;
}

Hsys::ErrorStatus ZyrImpArray::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = ZyrImpObj::audit(info); status != Hsys::eSuccess)
        return status;
    return forEachEntry([info](ZyrImpObj& entry) { return entry.audit(info); });
}

Hsys::ErrorStatus ZyrImpArray::getReferencedObjects(ZyrObjReferenceMap& map) const {
    ZyrImpObj::getReferencedObjects(map);
    return forEachEntry([&map](const ZyrImpObj& entry) { return entry.getReferencedObjects(map); });
}

Hsys::ErrorStatus ZyrImpArray::verifyReferences(int& badCount, bool fix) {
    ZyrImpObj::verifyReferences(badCount, fix);
    return forEachEntry(
        [&badCount, fix](ZyrImpObj& entry) { return entry.verifyReferences(badCount, fix); });
}

Hsys::ErrorStatus ZyrImpArray::subSetDatabaseDefaults(HsDbDatabase* database) {
    ZyrImpObj::subSetDatabaseDefaults(database);
    return forEachEntry(
        [database](ZyrImpObj& entry) { return entry.subSetDatabaseDefaults(database); });
}

Hsys::ErrorStatus ZyrImpArray::setToStandard(HsDbDatabase* database) {
    ZyrImpObj::setToStandard(database);
    return forEachEntry([database](ZyrImpObj& entry) { return entry.setToStandard(database); });
}

void ZyrImpArray::setTdfControlString(const wchar_t* controlString) {
    m_controlString = ZyrRmCString(controlString);
}

ZyrImpObj* ZyrImpArray::at(int index) const {
    if (index < 0 || index >= length())
        return nullptr;
    return m_entries[static_cast<std::size_t>(index)];
}

int ZyrImpArray::find(const ZyrImpObj* object) const {
    const auto found = std::find(m_entries.begin(), m_entries.end(), object);
    return found != m_entries.end() ? static_cast<int>(found - m_entries.begin()) : -1;
}

Hsys::ErrorStatus ZyrImpArray::insertAt(int index, ZyrImpObj* object) {
    if (object == nullptr)
        return Hsys::eNullPointer;
    if (index < 0 || index > length())
        return Hsys::eInvalidIndex;
    if (find(object) >= 0)
        return Hsys::eAlreadyPresent;
    assertParentWriteEnabled();
    m_entries.insert(m_entries.begin() + index, object);
    object->setParent(this);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArray::append(ZyrImpObj* object) {
    return insertAt(length(), object);
}

ZyrImpObj* ZyrImpArray::removeAt(int index) {
    ZyrImpObj* entry = at(index);
    if (entry == nullptr)
        return nullptr;
    assertParentWriteEnabled();
    m_entries.erase(m_entries.begin() + index);
    entry->setParent(static_cast<HsDbObject*>(nullptr));
    return entry;
}

Hsys::ErrorStatus ZyrImpArray::deleteAt(int index) {
    ZyrImpObj* entry = removeAt(index);
    if (entry == nullptr)
        return Hsys::eInvalidIndex;
    delete entry;
    return Hsys::eSuccess;
}

void ZyrImpArray::deleteAll() {
    if (m_entries.empty())
        return;
    assertParentWriteEnabled();
    zyrtl::deleteItems(m_entries);
}

void ZyrImpArray::replaceEntries(std::vector<ZyrImpObj*> entries) {
    zyrtl::deleteItems(m_entries);
    m_entries = std::move(entries);
    for (ZyrImpObj* entry : m_entries)
        entry->setParent(this);
}
