#include "platform/base/dict/ZyrDict.h"

#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/base/obj/ZyrDbDictRecord.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbNames.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/rx/HsRxClass.h"

#include <cwchar>
#include <memory>

HSRX_DEFINE_MEMBERS(ZyrDict, HsRxObject, 0, nullptr)

namespace {

Hsys::ErrorStatus checkName(const wchar_t* name) {
    if (name == nullptr)
        return Hsys::eNullPointer;
    if (*name == L'\0')
        return Hsys::eBadArgument;
    if (std::wcslen(name) > static_cast<size_t>(ZyrDict::kMaxNameLength))
        return Hsys::eStringTooLong;
    return Hsys::eSuccess;
}

} // namespace

ZyrDict::ZyrDict(const wchar_t* dictionaryName, HsRxClass* recordClass, HsRxClass* objectClass,
                 bool hasStandard, HsDbDatabase* database)
    : m_dictionaryName(dictionaryName), m_recordClass(recordClass), m_objectClass(objectClass),
      m_hasStandard(hasStandard), m_database(database) {}

ZyrDict::~ZyrDict() = default;

Hsys::ErrorStatus ZyrDict::findDictionary(HsDbDatabase* database, const wchar_t* dictionaryName,
                                          HsDbObjectId& id) {
    if (database == nullptr)
        return Hsys::eNoDatabase;
    if (dictionaryName == nullptr)
        return Hsys::eNullPointer;
    HsDbObjectPointer<HsDbDictionary> named(database->namedObjectsDictionaryId(), HsDb::kForRead);
    if (!named)
        return named.openStatus();
    HsDbObjectId found;
    if (named->getAt(dictionaryName, found) != Hsys::eSuccess)
        return Hsys::eNameNotFound;
    const HsRxClass* cls = found.objectClass();
    if (cls == nullptr || !cls->isDerivedFrom(HsDbDictionary::desc()))
        return Hsys::eWrongClass;
    id = found;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::recordName(const HsDbObjectId& id, ZyrRmCString& name) {
    if (id.isNull())
        return Hsys::eNullId;
    HsDbObjectPointer<ZyrDbDictRecord> record(id, HsDb::kForRead);
    if (!record)
        return record.openStatus();
    return record->getName(name);
}

Hsys::ErrorStatus ZyrDict::openDictionary(HsDbObjectPointer<HsDbDictionary>& dictionary,
                                          HsDb::OpenMode mode) const {
    HsDbObjectId id;
    if (findDictionary(m_database, m_dictionaryName, id) != Hsys::eSuccess)
        return Hsys::eInvalidDictionary;
    return dictionary.open(id, mode);
}

Hsys::ErrorStatus ZyrDict::createDictionary() {
    HsDbObjectPointer<HsDbDictionary> named(m_database->namedObjectsDictionaryId(),
                                            HsDb::kForWrite);
    if (!named)
        return named.openStatus();
    HsDbObjectPointer<HsDbDictionary> created(new HsDbDictionary);
    HsDbObjectId id;
    return named->setAt(m_dictionaryName, created.object(), id);
}

bool ZyrDict::isRecord(const HsDbObjectId& id) const {
    const HsRxClass* cls = id.objectClass();
    return cls != nullptr && cls->isDerivedFrom(m_recordClass);
}

bool ZyrDict::isStandardName(const wchar_t* name) const {
    return m_hasStandard && name != nullptr && hsdbNamesEqual(name, kStandardRecordName);
}

bool ZyrDict::isValid(bool createIfMissing, bool ensureStandard) {
    if (m_database == nullptr || m_recordClass == nullptr ||
        !m_recordClass->isDerivedFrom(ZyrDbDictRecord::desc()))
        return false;
    if (!hsdbDictionaryExists() && (!createIfMissing || createDictionary() != Hsys::eSuccess))
        return false;
    return !ensureStandard || ensureStandardEntries() == Hsys::eSuccess;
}

bool ZyrDict::hsdbDictionaryExists() const {
    HsDbObjectId id;
    return findDictionary(m_database, m_dictionaryName, id) == Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::getAt(const wchar_t* name, HsDbObjectId& id) const {
    id.setNull();
    if (name == nullptr)
        return Hsys::eNullPointer;
    HsDbObjectPointer<HsDbDictionary> dictionary;
    if (const Hsys::ErrorStatus status = openDictionary(dictionary, HsDb::kForRead);
        status != Hsys::eSuccess)
        return status;
    HsDbObjectId found;
    if (dictionary->getAt(name, found) != Hsys::eSuccess)
        return Hsys::eNameNotFound;
    if (!isRecord(found))
        return Hsys::eWrongClass;
    id = found;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::nameAt(const HsDbObjectId& id, ZyrRmCString& name) const {
    if (id.isNull())
        return Hsys::eNullId;
    HsDbObjectPointer<HsDbDictionary> dictionary;
    if (const Hsys::ErrorStatus status = openDictionary(dictionary, HsDb::kForRead);
        status != Hsys::eSuccess)
        return status;
    std::wstring found;
    if (dictionary->nameAt(id, found) != Hsys::eSuccess)
        return Hsys::eNameNotFound;
    if (!isRecord(id))
        return Hsys::eWrongClass;
    name = std::move(found);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::getRecordList(ZyrStrObjIdList& records) const {
    HsDbObjectPointer<HsDbDictionary> dictionary;
    if (const Hsys::ErrorStatus status = openDictionary(dictionary, HsDb::kForRead);
        status != Hsys::eSuccess)
        return status;
    for (const auto& [name, id] : dictionary->entries())
        if (isRecord(id))
            records.add(name, id);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::getRecordList(HsArray<HsDbObjectId>& ids) const {
    ZyrStrObjIdList records;
    const Hsys::ErrorStatus status = getRecordList(records);
    for (const ZyrStrObjIdList::Entry& record : records)
        ids.append(record.id);
    return status;
}

Hsys::ErrorStatus ZyrDict::getNamesInUse(ZyrRmCStringArray& names) const {
    ZyrStrObjIdList records;
    if (const Hsys::ErrorStatus status = getRecordList(records); status != Hsys::eSuccess)
        return status;
    for (const ZyrStrObjIdList::Entry& record : records)
        if (!extraPurgeCheck(record.id) || isReferenced(record.id))
            names.push_back(record.name);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::addNewRecord(const wchar_t* name, ZyrDbDictRecord* record) {
    HsDbObjectId id;
    return addNewRecord(name, record, id);
}

Hsys::ErrorStatus ZyrDict::addNewRecord(const wchar_t* name, ZyrDbDictRecord* record,
                                        HsDbObjectId& id) {
    if (record == nullptr)
        return Hsys::eNullPointer;
    if (const Hsys::ErrorStatus status = checkName(name); status != Hsys::eSuccess)
        return status;
    if (m_recordClass == nullptr || !record->isKindOf(m_recordClass))
        return Hsys::eWrongClass;
    if (record->database() != nullptr)
        return Hsys::eAlreadyPresent;
    HsDbObjectPointer<HsDbDictionary> dictionary;
    if (const Hsys::ErrorStatus status = openDictionary(dictionary, HsDb::kForWrite);
        status != Hsys::eSuccess)
        return status;
    if (dictionary->has(name))
        return Hsys::eDuplicateName;
    if (const Hsys::ErrorStatus status = record->setName(name); status != Hsys::eSuccess)
        return status;
    return dictionary->setAt(name, record, id);
}

bool ZyrDict::has(const wchar_t* name) const {
    HsDbObjectId id;
    return getAt(name, id) == Hsys::eSuccess;
}

bool ZyrDict::has(const HsDbObjectId& id) const {
    ZyrRmCString name;
    return nameAt(id, name) == Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::renameRecord(const wchar_t* oldName, const wchar_t* newName) {
    if (const Hsys::ErrorStatus status = checkName(newName); status != Hsys::eSuccess)
        return status;
    HsDbObjectId id;
    if (const Hsys::ErrorStatus status = getAt(oldName, id); status != Hsys::eSuccess)
        return status;
    ZyrRmCString currentName;
    nameAt(id, currentName);
    if (currentName == newName)
        return Hsys::eSuccess;
    if (isStandardName(currentName) && !isStandardName(newName))
        return Hsys::eDoesNotApply;
    HsDbObjectPointer<HsDbDictionary> dictionary;
    if (const Hsys::ErrorStatus status = openDictionary(dictionary, HsDb::kForWrite);
        status != Hsys::eSuccess)
        return status;
    HsDbObjectId taken;
    if (dictionary->getAt(newName, taken) == Hsys::eSuccess && taken != id)
        return Hsys::eDuplicateName;
    HsDbObjectPointer<ZyrDbDictRecord> record(id, HsDb::kForWrite);
    if (!record)
        return record.openStatus();
    if (const Hsys::ErrorStatus status = dictionary->setName(currentName, newName);
        status != Hsys::eSuccess)
        return status;
    return record->setName(newName);
}

Hsys::ErrorStatus ZyrDict::renameRecord(const HsDbObjectId& id, const wchar_t* newName) {
    ZyrRmCString oldName;
    if (const Hsys::ErrorStatus status = nameAt(id, oldName); status != Hsys::eSuccess)
        return status;
    return renameRecord(oldName, newName);
}

ZyrDbDictRecord* ZyrDict::newEntry() const {
    if (m_recordClass == nullptr)
        return nullptr;
    std::unique_ptr<HsRxObject> created(m_recordClass->create());
    if (ZyrDbDictRecord::cast(created.get()) == nullptr)
        return nullptr;
    return static_cast<ZyrDbDictRecord*>(created.release());
}

Hsys::ErrorStatus ZyrDict::cloneEntry(const HsDbObjectId& sourceId, const wchar_t* newName,
                                      HsDbObjectId& newId) {
    HsDbObjectPointer<ZyrDbDictRecord> source(sourceId, HsDb::kForRead);
    if (!source)
        return source.openStatus();
    if (m_recordClass == nullptr || !source->isKindOf(m_recordClass))
        return Hsys::eWrongClass;
    HsDbObjectPointer<ZyrDbDictRecord> copy(newEntry());
    if (!copy)
        return Hsys::eWrongClass;
    if (const Hsys::ErrorStatus status = copy->copyFrom(source.object()); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = addNewRecord(newName, copy.object(), newId);
        status != Hsys::eSuccess)
        return status;
    copy.close();
    return source->database() != m_database ? postImport(newId) : Hsys::eSuccess;
}

void ZyrDict::displayName(ZyrRmCString& name) const {
    if (!ZyrDecoratorManager::displayName(isA(), name))
        name = m_dictionaryName;
}

bool ZyrDict::extraPurgeCheck(const HsDbObjectId& id) const {
    return id.isNull() || id != standardRecord();
}

Hsys::ErrorStatus ZyrDict::ensureStandardEntries() {
    if (!m_hasStandard)
        return Hsys::eSuccess;
    if (!hsdbDictionaryExists())
        return Hsys::eInvalidDictionary;
    if (!standardRecord().isNull())
        return Hsys::eSuccess;
    HsDbObjectPointer<ZyrDbDictRecord> record(newEntry());
    if (!record)
        return Hsys::eWrongClass;
    HsDbObjectId id;
    if (const Hsys::ErrorStatus status = addNewRecord(kStandardRecordName, record.object(), id);
        status != Hsys::eSuccess)
        return status;
    return record->initializeStandardsAndDefaults(m_database);
}

HsDbObjectId ZyrDict::standardRecord() const {
    HsDbObjectId id;
    if (m_hasStandard)
        getAt(kStandardRecordName, id);
    return id;
}

Hsys::ErrorStatus ZyrDict::postImport(const HsDbObjectId& /*recordId*/) {
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDict::postExport(const HsDbObjectId& /*recordId*/) {
    return Hsys::eSuccess;
}

bool ZyrDict::isReferenced(const HsDbObjectId& id) const {
    ZyrBaseServices* services = ZyrBaseServices::service();
    ZyrObjRelGraph* graph = services != nullptr ? services->objRelGraph(m_database) : nullptr;
    HsDbObjectPointer<HsDbObject> record(id, HsDb::kForRead);
    if (graph == nullptr || !record)
        return true;
    HsArray<HsDbObjectId> referrers;
    HsArray<int> relationTypes;
    graph->getReferencesToMe(record.object(), referrers, relationTypes, true);
    return !referrers.isEmpty();
}
