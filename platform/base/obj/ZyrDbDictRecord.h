// The public base of named dictionary records; the name lives in the implementation object.
#pragma once

#include "platform/base/obj/ZyrDbObject.h"

class ZyrImpDictRecord;
class ZyrRmCString;

// Binary filing after ZyrDbObject's: int16 80.
class ZyrDbDictRecord : public ZyrDbObject {
    HSRX_DECLARE_MEMBERS(ZyrDbDictRecord)

public:
    // createImp true gives the record a plain ZyrImpDictRecord, which a derived class replaces.
    explicit ZyrDbDictRecord(bool createImp = true);
    ~ZyrDbDictRecord() override;

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

    // The implementation object as a record, or null when it is none.
    ZyrImpDictRecord* recordImp();
    const ZyrImpDictRecord* recordImp() const;

    // Read access. eNullPointer without a record implementation; name as it was then.
    Hsys::ErrorStatus getName(ZyrRmCString& name) const;
    // Write access; the dictionary that holds the record renames it through its dictionary, which
    // calls this. eNullPointer without a record implementation.
    Hsys::ErrorStatus setName(const ZyrRmCString& name);
    Hsys::ErrorStatus getDescription(ZyrRmCString& description) const;
    Hsys::ErrorStatus setDescription(const ZyrRmCString& description);
};
