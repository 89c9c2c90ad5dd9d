// The dictionary of area group definitions; it has a standard record.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/dict/ZyrDict.h"

class ZyrDictAreaGroupDef : public ZyrDict {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDictAreaGroupDef)

public:
    static constexpr const wchar_t* kDictionaryName = L"ZYR_AREA_GROUP_DEFS";

    explicit ZyrDictAreaGroupDef(HsDbDatabase* database);
    ~ZyrDictAreaGroupDef() override;

    // The standard record of the database, or the null id (Zyr::standardRecordOf).
    static HsDbObjectId getStandardAreaGroupDef(HsDbDatabase* database);
};
