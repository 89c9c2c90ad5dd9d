// The block table and its records; the model space record holds the drawing's entities.
#pragma once

#include "platform/host/db/HsDbSymbolTable.h"

class HsDbEntity;

// The name of the model space record.
inline constexpr const wchar_t* kHsDbModelSpace = L"*Model_Space";

class HsDbBlockTableRecord : public HsDbSymbolTableRecord {
    HSRX_DECLARE_MEMBERS(HsDbBlockTableRecord)

public:
    // Adds an entity that is in no database to the record's database, with its defaults, makes
    // the record its owner and leaves it open for write (the caller closes it). Needs write.
    // eNullPointer, eAlreadyPresent for an entity in a database, eNotInDatabase while the record
    // is in none.
    Hsys::ErrorStatus appendHsDbEntity(HsDbObjectId& id, HsDbEntity* entity);
    // In the order of appending, erased ones too.
    const std::vector<HsDbObjectId>& entityIds() const { return m_entities; }

    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    std::vector<HsDbObjectId> m_entities;
};

class HsDbBlockTable : public HsDbSymbolTable {
    HSRX_DECLARE_MEMBERS(HsDbBlockTable)

public:
    HsRxClass* recordClass() const override;
};
