// The view on one named dictionary of records under a database's named object dictionary: its
// records of one class, their unique names, and its standard record.
#pragma once

#include "platform/base/dict/ZyrStrObjIdList.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/rx/HsRxObject.h"
#include "platform/host/ut/HsArray.h"

class HsDbDatabase;
class HsDbDictionary;
class ZyrDbDictRecord;
template <class T> class HsDbObjectPointer;

// A dictionary object is made on the stack for one database where it is needed; it keeps nothing
// but what names the persistent dictionary, which it looks up on every call.
//
// The records are the entries whose object is of the record class; an entry of another class is
// foreign: it is no record, but its name is taken. Names compare without regard to A-Z case, are
// not empty and have at most kMaxNameLength characters. The dictionary key and the record's own
// name are kept equal.
//
// A dictionary with a standard record names it kStandardRecordName. That record cannot be renamed
// away (other records keep their ids and take new names freely), is never offered for purging, and
// is made by ensureStandardEntries when it is missing. Nothing here creates anything unless asked:
// isValid(false, false), getAt, standardRecord and the other readers only read.
class ZyrDict : public HsRxObject {
    HSRX_DECLARE_MEMBERS(ZyrDict)

public:
    static constexpr const wchar_t* kStandardRecordName = L"Standard";
    static constexpr int kMaxNameLength = 255;

    // recordClass is the class of the records (derived from ZyrDbDictRecord); objectClass the
    // class of the drawing objects that use them, or null when no single class does.
    ZyrDict(const wchar_t* dictionaryName, HsRxClass* recordClass, HsRxClass* objectClass,
            bool hasStandard, HsDbDatabase* database);
    ~ZyrDict() override;

    // The virtual operations, in the order of their slots. Every operation on records answers
    // eInvalidDictionary while the persistent dictionary is missing or is no dictionary.

    // The record of a name; id is null on every failure. eNullPointer for a null name,
    // eNameNotFound when no entry has it, eWrongClass for a foreign entry.
    virtual Hsys::ErrorStatus getAt(const wchar_t* name, HsDbObjectId& id) const;
    // The name of a record. eNullId for the null id, eNameNotFound when the id is no entry,
    // eWrongClass for a foreign entry; name stays as it was on failure.
    virtual Hsys::ErrorStatus nameAt(const HsDbObjectId& id, ZyrRmCString& name) const;
    // Append every record, in the order of their case-folded names.
    virtual Hsys::ErrorStatus getRecordList(ZyrStrObjIdList& records) const;
    virtual Hsys::ErrorStatus getRecordList(HsArray<HsDbObjectId>& ids) const;
    // Appends the names of the records that may not be purged: those that a live object of the
    // drawing refers to (by the relationship graph) and those extraPurgeCheck keeps. Without a
    // relationship graph no record can be shown unused, so every name is appended.
    virtual Hsys::ErrorStatus getNamesInUse(ZyrRmCStringArray& names) const;
    // Enters a record that is in no database under a name, gives it that name and leaves it open
    // for write: the caller closes it. eNullPointer for a null record or name, eBadArgument for an
    // empty name, eStringTooLong for a longer one than kMaxNameLength, eWrongClass for a record
    // of another class, eAlreadyPresent for a record in a database, eDuplicateName for a name
    // taken; the record is left as it was on failure.
    virtual Hsys::ErrorStatus addNewRecord(const wchar_t* name, ZyrDbDictRecord* record);
    virtual Hsys::ErrorStatus addNewRecord(const wchar_t* name, ZyrDbDictRecord* record,
                                           HsDbObjectId& id);
    virtual bool has(const wchar_t* name) const;
    virtual bool has(const HsDbObjectId& id) const;
    // Gives a record a new name; it keeps its id, so every reference to it stays. The statuses of
    // getAt (or nameAt) and of addNewRecord's name checks; eDoesNotApply for renaming the
    // standard record away; the open statuses of the record and the dictionary. A new name equal
    // to the old one changes nothing; one that differs only in case is taken.
    virtual Hsys::ErrorStatus renameRecord(const wchar_t* oldName, const wchar_t* newName);
    virtual Hsys::ErrorStatus renameRecord(const HsDbObjectId& id, const wchar_t* newName);
    // A new record of the record class, in no database and owned by the caller; null when the
    // class makes no record.
    virtual ZyrDbDictRecord* newEntry() const;
    // Adds a copy of a record, from this drawing or another, under a new name (left closed). A
    // record from another drawing is then passed to postImport. The open status of the source,
    // eWrongClass for a source of another class, the copy's status, then addNewRecord's.
    virtual Hsys::ErrorStatus cloneEntry(const HsDbObjectId& sourceId, const wchar_t* newName,
                                         HsDbObjectId& newId);
    // The dictionary's display name (its class decorator's text), else its persistent name.
    virtual void displayName(ZyrRmCString& name) const;
    // False when the dictionary itself keeps a record from purging whatever refers to it: the
    // standard record.
    virtual bool extraPurgeCheck(const HsDbObjectId& id) const;
    // Makes the standard record when the dictionary has one and it is missing: a new entry under
    // kStandardRecordName, set to its standards and the database's defaults. eSuccess when there
    // is nothing to make.
    virtual Hsys::ErrorStatus ensureStandardEntries();
    // The standard record, or the null id (no standard, or none made yet). Makes nothing.
    virtual HsDbObjectId standardRecord() const;
    // Called after a record came in from another drawing (cloneEntry), and by whoever copied a
    // record out of this drawing; a dictionary whose records refer to other objects fixes them
    // here. Nothing at this level.
    virtual Hsys::ErrorStatus postImport(const HsDbObjectId& recordId);
    virtual Hsys::ErrorStatus postExport(const HsDbObjectId& recordId);

    // True when the view can be used: a database, a record class derived from ZyrDbDictRecord
    // and the persistent dictionary. createIfMissing makes the dictionary when the database lacks
    // it; ensureStandard runs ensureStandardEntries and requires it to succeed. With both false
    // nothing is made.
    bool isValid(bool createIfMissing, bool ensureStandard);
    // Whether the database holds the persistent dictionary.
    bool hsdbDictionaryExists() const;

    HsDbDatabase* database() const { return m_database; }
    const ZyrRmCString& dictionaryName() const { return m_dictionaryName; }
    HsRxClass* recordClass() const { return m_recordClass; }
    HsRxClass* objectClass() const { return m_objectClass; }
    bool hasStandard() const { return m_hasStandard; }

    // The id of the dictionary of that name in a database's named object dictionary. eNoDatabase,
    // eNullPointer for a null name, eNameNotFound, or eWrongClass when the entry is no dictionary.
    static Hsys::ErrorStatus findDictionary(HsDbDatabase* database, const wchar_t* dictionaryName,
                                            HsDbObjectId& id);
    // The name of the dictionary record behind an id, read from the record. eNullId for the null
    // id; the open status, eWrongClass included, otherwise.
    static Hsys::ErrorStatus recordName(const HsDbObjectId& id, ZyrRmCString& name);

private:
    Hsys::ErrorStatus openDictionary(HsDbObjectPointer<HsDbDictionary>& dictionary,
                                     HsDb::OpenMode mode) const;
    Hsys::ErrorStatus createDictionary();
    bool isRecord(const HsDbObjectId& id) const;
    bool isStandardName(const wchar_t* name) const;
    // Whether a live object of the drawing refers to the record; true when nobody can tell.
    bool isReferenced(const HsDbObjectId& id) const;

    ZyrRmCString m_dictionaryName;
    HsRxClass* m_recordClass;
    HsRxClass* m_objectClass;
    bool m_hasStandard;
    HsDbDatabase* m_database;
};
