// The dictionary of area styles, which areas use; it has a standard record.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/dict/ZyrDict.h"

class ZyrDictAreaStyle : public ZyrDict {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDictAreaStyle)

public:
    static constexpr const wchar_t* kDictionaryName = L"ZYR_AREA_STYLES";

    explicit ZyrDictAreaStyle(HsDbDatabase* database);
    ~ZyrDictAreaStyle() override;

    // The standard record of the database, or the null id (Zyr::standardRecordOf).
    static HsDbObjectId getStandardAreaStyle(HsDbDatabase* database);
};
