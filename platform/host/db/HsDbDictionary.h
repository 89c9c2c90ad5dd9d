// A persistent dictionary: named entries that own objects of the database, dictionaries among them.
#pragma once

#include "platform/host/db/HsDbObject.h"

#include <map>
#include <string>
#include <utility>
#include <vector>

// Names are compared without regard to A-Z case and keep the spelling they were given. An entry
// whose object is erased is hidden: it is not found, not counted, and its name can be taken again.
// Readers need not open the dictionary for write; every change asserts write.
class HsDbDictionary : public HsDbObject {
    HSRX_DECLARE_MEMBERS(HsDbDictionary)

public:
    // eNullPointer for a null name, eKeyNotFound when no live entry has it.
    Hsys::ErrorStatus getAt(const wchar_t* name, HsDbObjectId& id) const;
    // getAt, then hsdbOpenObject of the id; the caller closes the object.
    Hsys::ErrorStatus getAt(const wchar_t* name, HsDbObject*& object, HsDb::OpenMode mode) const;
    bool has(const wchar_t* name) const;
    bool has(const HsDbObjectId& id) const;
    // The name of a live entry of the id; eKeyNotFound when there is none.
    Hsys::ErrorStatus nameAt(const HsDbObjectId& id, std::wstring& name) const;
    int numEntries() const;
    // The live entries in the order of their folded names.
    std::vector<std::pair<std::wstring, HsDbObjectId>> entries() const;

    // Enters an object under a name and makes the dictionary its owner. An object in no database
    // is added to the dictionary's database and left open for write (the caller closes it); an
    // object of the database must be open for write. eBadArgument for an empty name or an object
    // of another database, eNullPointer for null, eDuplicateName when a live entry has the name,
    // eNotInDatabase while the dictionary itself is in none.
    Hsys::ErrorStatus setAt(const wchar_t* name, HsDbObject* object, HsDbObjectId& id);
    // Takes the entry out; the object stays in the database. eKeyNotFound when there is none.
    Hsys::ErrorStatus remove(const wchar_t* name);
    Hsys::ErrorStatus remove(const wchar_t* name, HsDbObjectId& id);
    // eKeyNotFound, eDuplicateName (another live entry has the new name) or eBadArgument (empty).
    Hsys::ErrorStatus setName(const wchar_t* oldName, const wchar_t* newName);

    // Entries whose object is missing are reported, and taken out when the audit may fix.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    // A count, then each name with its id as a hard ownership. A stream with an empty or a twice
    // used name fails the filer with eFilerError and leaves the entries as they were.
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    struct Entry {
        std::wstring name;
        HsDbObjectId id;
    };
    using Entries = std::map<std::wstring, Entry>;

    // The live entry of a name, or null.
    const Entry* find(const wchar_t* name) const;

    Entries m_entries;
};
