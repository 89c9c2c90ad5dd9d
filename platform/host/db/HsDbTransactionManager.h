// Transactions of one database: what a transaction opens belongs to it, and an abort puts back
// every object that was changed while it ran.
#pragma once

#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstdint>
#include <memory>
#include <unordered_map>
#include <unordered_set>
#include <vector>

class HsDbDatabase;
class HsDbObject;
struct HsDbIdEntry;

// One level of the stack of transactions.
class HsDbTransaction {
public:
    // The objects opened in this transaction, in the order of their first open; those of an inner
    // transaction that ended come after.
    const std::vector<HsDbObjectId>& openedObjects() const { return m_opened; }

private:
    friend class HsDbTransactionManager;

    // An object's filed fields and erase flag as they were before its first change.
    struct Snapshot {
        std::vector<std::uint8_t> fields;
        bool erased = false;
    };

    std::vector<HsDbObjectId> m_opened;
    std::unordered_map<HsDbIdEntry*, Snapshot> m_snapshots;
    std::unordered_set<HsDbIdEntry*> m_added;
};

// Transactions nest. An object is opened once for all of them: a later request in a stronger mode
// upgrades it. Ending the outermost transaction closes every object it holds; ending an inner one
// hands its objects to the one around it. Every change to an object of the database while a
// transaction runs is recorded, whoever opened the object, so that an abort can undo it; objects
// added during an aborted transaction are erased.
class HsDbTransactionManager {
public:
    explicit HsDbTransactionManager(HsDbDatabase* database);
    ~HsDbTransactionManager();
    HsDbTransactionManager(const HsDbTransactionManager&) = delete;
    HsDbTransactionManager& operator=(const HsDbTransactionManager&) = delete;

    HsDbTransaction* startTransaction();
    // eNoTransaction when none runs.
    Hsys::ErrorStatus endTransaction();
    // Restores what the transaction changed and closes what it opened. eNoTransaction when none
    // runs; otherwise the first failure of an object to read its recorded fields back, after all
    // were tried.
    Hsys::ErrorStatus abortTransaction();
    int numActiveTransactions() const { return static_cast<int>(m_stack.size()); }
    // The innermost running transaction, or null.
    HsDbTransaction* topTransaction() const;

    // Opens an object of this database in the running transaction, which owns the open: callers
    // do not close it. The statuses of hsdbOpenObject, and eNoTransaction when none runs.
    Hsys::ErrorStatus getObject(HsDbObject*& object, HsDbObjectId id, HsDb::OpenMode mode,
                                bool openErased = false);

private:
    friend class HsDbDatabase;
    friend class HsDbObject;

    // Called by every write assertion: notes the object's state in each running transaction that
    // has not noted it yet and did not add the object.
    void recordUndo(HsDbObject* object);
    void recordAdded(HsDbIdEntry* entry);
    // Drops every transaction without touching an object: the database is emptied.
    void forgetAll();
    Hsys::ErrorStatus restore(HsDbIdEntry* entry, const HsDbTransaction::Snapshot& snapshot);
    void closeAll(const std::vector<HsDbObjectId>& ids);

    HsDbDatabase* m_database;
    std::vector<std::unique_ptr<HsDbTransaction>> m_stack;
    // The objects open in a running transaction, and in which mode.
    std::unordered_map<HsDbIdEntry*, HsDb::OpenMode> m_held;
};
