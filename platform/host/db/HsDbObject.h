// The root of every object a drawing database stores, with the protocol to open, close and file it.
#pragma once

#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/rx/HsRxObject.h"

#include <string>

class HsDbAuditInfo;
class HsDbBdfFiler;
class HsDbDatabase;
class HsDbTdfFiler;

// An object in a database is reached by opening its id: for read (any number of readers), for
// write (one writer and no reader) or for notify, and closed by whoever opened it. The database
// owns it. An object that is in no database belongs to whoever made it: it is always read and write
// enabled, and its maker deletes it (closing it does nothing).
class HsDbObject : public HsRxObject {
    HSRX_DECLARE_MEMBERS(HsDbObject)

public:
    HsDbObject() = default;
    HsDbObject(const HsDbObject&) = delete;
    HsDbObject& operator=(const HsDbObject&) = delete;
    // Deleting an object that a database still owns ends the process: only the database may.
    ~HsDbObject() override;

    // The virtual operations, in the order of their slots.
    // Called before erase(erasing) changes anything; a failure refuses the erase.
    virtual Hsys::ErrorStatus subErase(bool erasing);
    // Called before handOverTo gives this object's place to another; a failure refuses it.
    virtual Hsys::ErrorStatus subHandOverTo(HsDbObject* newObject);
    // Called when the object enters a database and by setDatabaseDefaults of entities: fills what
    // is unset from the database's standard records.
    virtual void subSetDatabaseDefaults(HsDbDatabase* database);
    // Checks the object's references; prints, counts, and repairs when the audit may fix. The
    // object is open for write when it may fix, for read otherwise.
    virtual Hsys::ErrorStatus audit(HsDbAuditInfo* info);
    // Each class files its base's fields first and then its own. This level files the owner: as
    // a soft pointer id, and as an optional item of group 330 in text.
    virtual Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer);
    virtual Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const;
    virtual Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer);
    virtual Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const;

    // Null while the object is in no database.
    HsDbObjectId objectId() const;
    HsDbObjectId ownerId() const { return m_ownerId; }
    // Needs write.
    void setOwnerId(const HsDbObjectId& ownerId);
    // The database that owns the object, or null.
    HsDbDatabase* database() const;

    // Ends one open: the write open, or one of the reads, or the notify open. An object in no
    // database gives eNotInDatabase and stays as it is; one that is not open gives eNotOpenForRead.
    Hsys::ErrorStatus close();
    // From the only read open to write: eSuccess. eAlreadyWritable when open for write (or in no
    // database); eWasOpenForRead while other readers hold it; eNotOpenForRead when not open.
    Hsys::ErrorStatus upgradeOpen();
    // From write to one read open: eSuccess; eNotOpenForWrite otherwise.
    Hsys::ErrorStatus downgradeOpen();

    bool isReadEnabled() const;
    bool isWriteEnabled() const;
    bool isNotifyEnabled() const;
    // Each throws HsAssertionViolation when the object may not be read (written, notified).
    void assertReadEnabled() const;
    // autoUndo records the object's state for the running transactions before the first change;
    // recordModified marks it modified until it is closed.
    void assertWriteEnabled(bool autoUndo = true, bool recordModified = true);
    void assertNotifyEnabled() const;
    // True when the object was written since it was opened.
    bool isModified() const { return m_modified; }

    // Erases (true) or restores (false) the object; needs write. Erasing again, or restoring an
    // object that is not erased, changes nothing and succeeds.
    Hsys::ErrorStatus erase(bool erasing = true);
    bool isErased() const;
    // True while an aborted transaction puts the object's fields back.
    bool isUndoing() const { return m_undoing; }

    // Gives this object's id, owner and write open to newObject, which must be in no database. This
    // object leaves the database; its caller deletes it. Needs write; refused inside a transaction,
    // which could not bring the old object back.
    Hsys::ErrorStatus handOverTo(HsDbObject* newObject);

    // The filing entry points: they check the open state and run the virtual fields operations;
    // the result is the first failure of the fields or of the filer.
    Hsys::ErrorStatus bdfIn(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOut(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus tdfIn(HsDbTdfFiler* filer);
    Hsys::ErrorStatus tdfOut(HsDbTdfFiler* filer) const;

    // "HsDbDictionary(12)": class and handle, as audits and messages name an object.
    std::wstring describe() const;

private:
    friend class HsDbDatabase;
    friend class HsDbTransactionManager;
    friend Hsys::ErrorStatus hsdbOpenObject(HsDbObject*&, HsDbObjectId, HsDb::OpenMode, bool,
                                            const HsRxClass*);

    // Takes one more open in the mode, or says which open stands in the way.
    Hsys::ErrorStatus openFor(HsDb::OpenMode mode);
    [[noreturn]] void failAssertion(const char* expected) const;

    HsDbIdEntry* m_entry = nullptr;
    HsDbObjectId m_ownerId;
    int m_readers = 0;
    bool m_writer = false;
    bool m_notify = false;
    bool m_modified = false;
    bool m_undoing = false;
};

// Opens the object behind an id. On success object holds it, and the caller closes it; on failure
// object is null. Statuses: eNullId for the null id, eKeyNotFound for a handle with no object,
// eWasErased for an erased object unless openErased, eWrongClass when the object is not of
// objectClass (null accepts every class), and eWasOpenForRead, eWasOpenForWrite or
// eWasOpenForNotify when an open stands in the way.
Hsys::ErrorStatus hsdbOpenObject(HsDbObject*& object, HsDbObjectId id, HsDb::OpenMode mode,
                                 bool openErased = false, const HsRxClass* objectClass = nullptr);

// The typed form: the object must be a T.
template <class T>
Hsys::ErrorStatus hsdbOpenObject(T*& object, HsDbObjectId id, HsDb::OpenMode mode,
                                 bool openErased = false) {
    HsDbObject* opened = nullptr;
    const Hsys::ErrorStatus status = hsdbOpenObject(opened, id, mode, openErased, T::desc());
    object = static_cast<T*>(opened);
    return status;
}
