// The dictionary of area modifiers; it has no standard record, so a drawing can have none.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/dict/ZyrDict.h"

class ZyrDictAreaModifiers : public ZyrDict {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDictAreaModifiers)

public:
    static constexpr const wchar_t* kDictionaryName = L"ZYR_AREA_MODIFIERS";

    explicit ZyrDictAreaModifiers(HsDbDatabase* database);
    ~ZyrDictAreaModifiers() override;
};
