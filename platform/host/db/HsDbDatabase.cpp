#include "platform/host/db/HsDbDatabase.h"

#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabaseReactor.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/db/HsDbTextStyleTable.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/file/HsDbDrawingFile.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutFormat.h"

#include <algorithm>
#include <utility>

HSRX_DEFINE_MEMBERS(HsDbDatabase, HsRxObject, 0, nullptr)

namespace {

// The size the standard text style gives its texts, in drawing units.
constexpr double kStandardTextSize = 2.5;

bool isRecordOf(const HsDbObjectId& id, HsDbDatabase* database, HsRxClass* recordClass) {
    const HsRxClass* cls = id.objectClass();
    return id.database() == database && cls != nullptr && cls->isDerivedFrom(recordClass);
}

// The standard records are made in a new database, before anyone can hold a table open, so
// neither the open nor the add can fail.
HsDbObjectId addRecord(HsDbObjectId tableId, HsDbSymbolTableRecord* record, const wchar_t* name) {
    record->setName(name);
    HsDbSymbolTable* table = nullptr;
    hsdbOpenObject(table, tableId, HsDb::kForWrite);
    HsDbObjectId id;
    table->add(id, record);
    record->close();
    table->close();
    return id;
}

// A reactor may remove itself or another one while it is told; the list is walked on a copy and
// each reactor is asked whether it is still registered when its turn comes.
template <class Report>
void tellRegistered(const std::vector<HsDbDatabaseReactor*>& reactors, Report report) {
    const std::vector<HsDbDatabaseReactor*> snapshot = reactors;
    for (HsDbDatabaseReactor* reactor : snapshot)
        if (std::find(reactors.begin(), reactors.end(), reactor) != reactors.end())
            report(reactor);
}

} // namespace

HsDbDatabase::HsDbDatabase(HsDb::DrawingSetup setup, HsDb::TransactionSupport transactions) {
    if (transactions == HsDb::kWithTransactions)
        m_transactions = std::make_unique<HsDbTransactionManager>(this);
    if (setup == HsDb::kStandardRecords)
        makeStandardRecords();
}

HsDbDatabase::~HsDbDatabase() {
    notifyReactors(&HsDbDatabaseReactor::goodbye);
    m_reactors.clear();
    if (hsdbHostApplicationServices()->workingDatabase() == this)
        hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
    clear();
}

void HsDbDatabase::makeStandardRecords() {
    auto addOwnerless = [this](HsDbObject* object) {
        HsDbObjectId id;
        addHsDbObject(id, object);
        object->close();
        return id;
    };
    m_roots.namedObjects = addOwnerless(new HsDbDictionary);
    m_roots.blockTable = addOwnerless(new HsDbBlockTable);
    m_roots.layerTable = addOwnerless(new HsDbLayerTable);
    m_roots.textStyleTable = addOwnerless(new HsDbTextStyleTable);

    m_roots.modelSpace = addRecord(m_roots.blockTable, new HsDbBlockTableRecord, kHsDbModelSpace);
    m_roots.currentLayer = addRecord(m_roots.layerTable, new HsDbLayerTableRecord, kHsDbLayerZero);
    auto* standard = new HsDbTextStyleTableRecord;
    standard->setTextSize(kStandardTextSize);
    m_roots.currentTextStyle = addRecord(m_roots.textStyleTable, standard, kHsDbStandardTextStyle);
}

HsDbIdEntry* HsDbDatabase::newEntry(std::uint64_t handle) {
    auto entry = std::make_unique<HsDbIdEntry>();
    entry->database = this;
    entry->handle = handle;
    HsDbIdEntry* made = entry.get();
    m_entries.emplace(handle, std::move(entry));
    if (handle >= m_nextHandle)
        m_nextHandle = handle + 1;
    return made;
}

Hsys::ErrorStatus HsDbDatabase::addHsDbObject(HsDbObjectId& id, HsDbObject* object) {
    if (object == nullptr)
        return Hsys::eNullPointer;
    if (object->m_entry != nullptr)
        return Hsys::eAlreadyPresent;
    HsDbIdEntry* entry = newEntry(m_nextHandle);
    adopt(entry, object);
    object->m_writer = true;
    if (m_transactions != nullptr)
        m_transactions->recordAdded(entry);
    object->subSetDatabaseDefaults(this);
    id = HsDbObjectId(entry);
    notifyAppended(object);
    return Hsys::eSuccess;
}

void HsDbDatabase::adopt(HsDbIdEntry* entry, HsDbObject* object) {
    entry->object = object;
    object->m_entry = entry;
}

HsDbObject* HsDbDatabase::disown(HsDbIdEntry* entry) {
    HsDbObject* object = std::exchange(entry->object, nullptr);
    object->m_entry = nullptr;
    object->m_readers = 0;
    object->m_writer = false;
    object->m_notify = false;
    return object;
}

Hsys::ErrorStatus HsDbDatabase::getHsDbObjectId(HsDbObjectId& id, bool createIfNotFound,
                                                std::uint64_t handle) {
    if (handle == 0)
        return Hsys::eNullId;
    auto found = m_entries.find(handle);
    if (found != m_entries.end()) {
        id = HsDbObjectId(found->second.get());
        return Hsys::eSuccess;
    }
    if (!createIfNotFound)
        return Hsys::eKeyNotFound;
    id = HsDbObjectId(newEntry(handle));
    return Hsys::eSuccess;
}

std::vector<HsDbObjectId> HsDbDatabase::objectIds() const {
    std::vector<HsDbObjectId> ids;
    ids.reserve(m_entries.size());
    for (const auto& [handle, entry] : m_entries)
        if (entry->object != nullptr)
            ids.emplace_back(entry.get());
    return ids;
}

Hsys::ErrorStatus HsDbDatabase::setCurrentLayerId(const HsDbObjectId& layerId) {
    if (!isRecordOf(layerId, this, HsDbLayerTableRecord::desc()))
        return Hsys::eWrongClass;
    m_roots.currentLayer = layerId;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDatabase::setCurrentTextStyleId(const HsDbObjectId& textStyleId) {
    if (!isRecordOf(textStyleId, this, HsDbTextStyleTableRecord::desc()))
        return Hsys::eWrongClass;
    m_roots.currentTextStyle = textStyleId;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDatabase::setDisplayPrecision(int decimals) {
    if (decimals < 0 || decimals > 8)
        return Hsys::eBadArgument;
    m_units.precision = decimals;
    return Hsys::eSuccess;
}

double HsDbDatabase::displayFactor() const {
    if (m_units.drawing == HsDb::kUnitsUnitless || m_units.display == HsDb::kUnitsUnitless)
        return 1.0;
    return HsDb::metersPerUnit(m_units.drawing) / HsDb::metersPerUnit(m_units.display);
}

double HsDbDatabase::lengthInDisplayUnits(double length) const {
    return length * displayFactor();
}

double HsDbDatabase::areaInDisplayUnits(double area) const {
    const double factor = displayFactor();
    return area * factor * factor;
}

Hsys::ErrorStatus HsDbDatabase::getFilename(const wchar_t*& fileName) const {
    fileName = m_fileName.c_str();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDatabase::saveAs(const wchar_t* fileName, std::wstring* reason) {
    if (fileName == nullptr)
        return Hsys::eNullPointer;
    const Hsys::ErrorStatus status = HsDbDrawingFile::save(this, fileName, reason);
    if (status == Hsys::eSuccess)
        m_fileName = fileName;
    return status;
}

Hsys::ErrorStatus HsDbDatabase::readDrawingFile(const wchar_t* fileName, std::wstring* reason) {
    if (fileName == nullptr)
        return Hsys::eNullPointer;
    if (!m_entries.empty())
        return Hsys::eDoesNotApply;
    const Hsys::ErrorStatus status = HsDbDrawingFile::load(this, fileName, reason);
    if (status != Hsys::eSuccess) {
        clear();
        return status;
    }
    m_fileName = fileName;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbDatabase::audit(HsDbAuditInfo* info) {
    if (info == nullptr)
        return Hsys::eNullPointer;
    const HsDb::OpenMode mode = info->fixErrors() ? HsDb::kForWrite : HsDb::kForRead;
    for (const HsDbObjectId& id : objectIds()) {
        if (id.isErased())
            continue;
        HsDbObject* object = nullptr;
        if (const Hsys::ErrorStatus status = hsdbOpenObject(object, id, mode);
            status != Hsys::eSuccess) {
            const std::wstring why = hsutFormat(L"cannot be opened (%S)", Hsys::toString(status));
            info->printError(L"object", std::to_wstring(id.handle()).c_str(), why.c_str(),
                             L"skipped");
            info->errorsFound(1);
            continue;
        }
        object->audit(info);
        object->close();
    }
    return Hsys::eSuccess;
}

void HsDbDatabase::addReactor(HsDbDatabaseReactor* reactor) {
    if (reactor != nullptr &&
        std::find(m_reactors.begin(), m_reactors.end(), reactor) == m_reactors.end())
        m_reactors.push_back(reactor);
}

void HsDbDatabase::removeReactor(HsDbDatabaseReactor* reactor) {
    std::erase(m_reactors, reactor);
}

void HsDbDatabase::notifyReactors(void (HsDbDatabaseReactor::*report)(HsDbDatabase*)) {
    tellRegistered(m_reactors,
                   [this, report](HsDbDatabaseReactor* reactor) { (reactor->*report)(this); });
}

void HsDbDatabase::notifyAppended(HsDbObject* object) {
    tellRegistered(m_reactors, [this, object](HsDbDatabaseReactor* reactor) {
        reactor->objectAppended(this, object);
    });
}

void HsDbDatabase::clear() {
    const bool heldObjects = !m_entries.empty();
    for (auto& [handle, entry] : m_entries)
        if (entry->object != nullptr)
            delete disown(entry.get());
    m_entries.clear();
    if (m_transactions != nullptr)
        m_transactions->forgetAll();
    m_nextHandle = 1;
    m_roots = Roots{};
    m_xrefBlockId.setNull();
    if (heldObjects)
        notifyReactors(&HsDbDatabaseReactor::databaseCleared);
}
