#include "platform/host/db/HsDbTransactionManager.h"

#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/filer/HsDbBdfFiler.h"

HsDbTransactionManager::HsDbTransactionManager(HsDbDatabase* database) : m_database(database) {}

HsDbTransactionManager::~HsDbTransactionManager() = default;

HsDbTransaction* HsDbTransactionManager::startTransaction() {
    m_stack.push_back(std::make_unique<HsDbTransaction>());
    return m_stack.back().get();
}

HsDbTransaction* HsDbTransactionManager::topTransaction() const {
    return m_stack.empty() ? nullptr : m_stack.back().get();
}

Hsys::ErrorStatus HsDbTransactionManager::endTransaction() {
    if (m_stack.empty())
        return Hsys::eNoTransaction;
    std::unique_ptr<HsDbTransaction> ended = std::move(m_stack.back());
    m_stack.pop_back();
    if (m_stack.empty()) {
        closeAll(ended->m_opened);
        return Hsys::eSuccess;
    }
    std::vector<HsDbObjectId>& outer = m_stack.back()->m_opened;
    outer.insert(outer.end(), ended->m_opened.begin(), ended->m_opened.end());
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbTransactionManager::abortTransaction() {
    if (m_stack.empty())
        return Hsys::eNoTransaction;
    std::unique_ptr<HsDbTransaction> aborted = std::move(m_stack.back());
    m_stack.pop_back();
    Hsys::ErrorStatus result = Hsys::eSuccess;
    for (const auto& [entry, snapshot] : aborted->m_snapshots)
        if (const Hsys::ErrorStatus status = restore(entry, snapshot); result == Hsys::eSuccess)
            result = status;
    for (HsDbIdEntry* entry : aborted->m_added)
        entry->erased = true;
    closeAll(aborted->m_opened);
    return result;
}

Hsys::ErrorStatus HsDbTransactionManager::restore(HsDbIdEntry* entry,
                                                  const HsDbTransaction::Snapshot& snapshot) {
    // Hand-overs are refused while a transaction runs, so the entry holds the noted object still.
    HsDbObject* object = entry->object;
    entry->erased = snapshot.erased;
    // The fields go back whoever holds the object open; its opens stay as they are, also when
    // its reader throws.
    struct UndoScope {
        explicit UndoScope(HsDbObject* undone)
            : object(undone), readers(undone->m_readers), writer(undone->m_writer),
              notify(undone->m_notify) {
            object->m_readers = 0;
            object->m_writer = true;
            object->m_notify = false;
            object->m_undoing = true;
        }
        ~UndoScope() {
            object->m_undoing = false;
            object->m_readers = readers;
            object->m_writer = writer;
            object->m_notify = notify;
        }
        UndoScope(const UndoScope&) = delete;
        UndoScope& operator=(const UndoScope&) = delete;

        HsDbObject* object;
        int readers;
        bool writer;
        bool notify;
    };
    UndoScope scope(object);
    HsDbBdfFiler filer(snapshot.fields, m_database, HsDb::kUndoFiler);
    const Hsys::ErrorStatus status = object->bdfIn(&filer);
    return status;
}

void HsDbTransactionManager::closeAll(const std::vector<HsDbObjectId>& ids) {
    for (const HsDbObjectId& id : ids) {
        m_held.erase(id.entry());
        if (HsDbObject* object = id.entry()->object)
            object->close();
    }
}

Hsys::ErrorStatus HsDbTransactionManager::getObject(HsDbObject*& object, HsDbObjectId id,
                                                    HsDb::OpenMode mode, bool openErased) {
    object = nullptr;
    if (m_stack.empty())
        return Hsys::eNoTransaction;
    if (!id.isNull() && id.database() != m_database)
        return Hsys::eBadArgument;
    auto held = m_held.find(id.entry());
    if (held == m_held.end()) {
        const Hsys::ErrorStatus status = hsdbOpenObject(object, id, mode, openErased);
        if (status != Hsys::eSuccess)
            return status;
        m_stack.back()->m_opened.push_back(id);
        m_held.emplace(id.entry(), mode);
        return Hsys::eSuccess;
    }
    if (id.isErased() && !openErased)
        return Hsys::eWasErased;
    HsDbObject* target = id.entry()->object;
    const HsDb::OpenMode heldMode = held->second;
    if (heldMode == HsDb::kForRead && mode == HsDb::kForWrite) {
        if (const Hsys::ErrorStatus status = target->upgradeOpen(); status != Hsys::eSuccess)
            return status;
        held->second = HsDb::kForWrite;
    } else if (heldMode != mode && !(heldMode == HsDb::kForWrite && mode == HsDb::kForRead)) {
        return heldMode == HsDb::kForNotify  ? Hsys::eWasOpenForNotify
               : heldMode == HsDb::kForWrite ? Hsys::eWasOpenForWrite
                                             : Hsys::eWasOpenForRead;
    }
    object = target;
    return Hsys::eSuccess;
}

void HsDbTransactionManager::recordUndo(HsDbObject* object) {
    HsDbIdEntry* entry = object->m_entry;
    std::vector<std::uint8_t> fields;
    bool filed = false;
    for (const auto& transaction : m_stack) {
        if (transaction->m_added.contains(entry) || transaction->m_snapshots.contains(entry))
            continue;
        if (!filed) {
            HsDbBdfFiler filer(m_database, HsDb::kUndoFiler);
            object->bdfOutFields(&filer);
            fields = filer.bytes();
            filed = true;
        }
        transaction->m_snapshots.emplace(entry, HsDbTransaction::Snapshot{fields, entry->erased});
    }
}

void HsDbTransactionManager::recordAdded(HsDbIdEntry* entry) {
    for (const auto& transaction : m_stack)
        transaction->m_added.insert(entry);
}

void HsDbTransactionManager::forgetAll() {
    m_stack.clear();
    m_held.clear();
}
