// The implementation base of named dictionary records (styles, definitions, lists): the record's
// name and description.
#pragma once

#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/res/ZyrRmCString.h"

// The name is the record's name in its dictionary; the dictionary keeps its key and this name in
// step when it renames a record. Both texts are filed.
//
// Binary filing after ZyrImpObj's: int16 80, the name, the description (system strings). Adds no
// summary rows: each record class shows what it holds.
class ZyrImpDictRecord : public ZyrImpObj {
    HSRX_DECLARE_MEMBERS(ZyrImpDictRecord)

public:
    ZyrImpDictRecord();
    ~ZyrImpDictRecord() override;

    // ZyrImpObj's, then name and description; eBadArgument for an object that is no record.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

    const ZyrRmCString& name() const { return m_name; }
    // Unchanged: eSuccess and no write. Otherwise asserts write on the parent and stores.
    Hsys::ErrorStatus setName(const ZyrRmCString& name);
    const ZyrRmCString& description() const { return m_description; }
    Hsys::ErrorStatus setDescription(const ZyrRmCString& description);

private:
    // This level's own fields, after its base's and its version word.
    Hsys::ErrorStatus bdfInOwnFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutOwnFields(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus setText(ZyrRmCString& field, const ZyrRmCString& text);

    ZyrRmCString m_name;
    ZyrRmCString m_description;
};
