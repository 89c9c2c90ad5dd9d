// The dictionary of lists of proposed names; it has a standard record.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/dict/ZyrDict.h"

class ZyrDictAreaProposalNames : public ZyrDict {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDictAreaProposalNames)

public:
    static constexpr const wchar_t* kDictionaryName = L"ZYR_AREA_PROPOSALNAMES";

    explicit ZyrDictAreaProposalNames(HsDbDatabase* database);
    ~ZyrDictAreaProposalNames() override;

    // The standard record of the database, or the null id (Zyr::standardRecordOf).
    static HsDbObjectId getStandardAreaProposalNames(HsDbDatabase* database);
};
