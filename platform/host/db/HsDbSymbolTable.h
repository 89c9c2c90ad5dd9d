// Symbol tables: named records of one kind (blocks, layers, text styles), owned by their table.
#pragma once

#include "platform/host/db/HsDbObject.h"

#include <string>
#include <vector>

class HsDbSymbolTable;

// A record's name is unique in its table without regard to A-Z case.
class HsDbSymbolTableRecord : public HsDbObject {
    HSRX_DECLARE_MEMBERS(HsDbSymbolTableRecord)

public:
    const std::wstring& name() const { return m_name; }
    Hsys::ErrorStatus getName(const wchar_t*& name) const;
    // Needs write. eBadArgument for an empty name, eDuplicateName when another live record of the
    // record's table has it.
    Hsys::ErrorStatus setName(const wchar_t* name);

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    std::wstring m_name;
};

// Records are kept in the order they were added. Lookups by name skip erased records.
class HsDbSymbolTable : public HsDbObject {
    HSRX_DECLARE_MEMBERS(HsDbSymbolTable)

public:
    // The class of the records the table takes.
    virtual HsRxClass* recordClass() const = 0;

    // eNullPointer for a null name, eKeyNotFound when no live record has it.
    Hsys::ErrorStatus getAt(const wchar_t* name, HsDbObjectId& id) const;
    bool has(const wchar_t* name) const;
    // Every record, erased ones too.
    const std::vector<HsDbObjectId>& recordIds() const { return m_records; }

    // Adds a named record that is in no database to the table's database and leaves it open for
    // write (the caller closes it). eNullPointer, eWrongClass for a record of another kind,
    // eBadArgument for an empty name, eDuplicateName, eAlreadyPresent for a record in a database,
    // eNotInDatabase while the table is in none.
    Hsys::ErrorStatus add(HsDbObjectId& id, HsDbSymbolTableRecord* record);

    // Records whose object is missing are reported, and taken out when the audit may fix.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    friend class HsDbSymbolTableRecord;

    // The live record of a name, or null.
    const HsDbSymbolTableRecord* find(std::wstring_view name) const;

    std::vector<HsDbObjectId> m_records;
};

// Host use: reports the ids of a list of owned objects that have no object, and takes them out
// when the audit may fix; role names the list in the printed line.
void hsdbAuditOwnedIds(HsDbObject* owner, HsDbAuditInfo* info, std::vector<HsDbObjectId>& ids,
                       const wchar_t* role);
