// The dictionary of area group styles, which area groups use; it has a standard record.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/dict/ZyrDict.h"

class ZyrDictAreaGroupStyle : public ZyrDict {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDictAreaGroupStyle)

public:
    static constexpr const wchar_t* kDictionaryName = L"ZYR_AREAGROUP_STYLES";

    explicit ZyrDictAreaGroupStyle(HsDbDatabase* database);
    ~ZyrDictAreaGroupStyle() override;

    // The standard record of the database, or the null id (Zyr::standardRecordOf).
    static HsDbObjectId getStandardAreaGroupStyle(HsDbDatabase* database);
};
