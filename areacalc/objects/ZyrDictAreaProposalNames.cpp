#include "areacalc/objects/ZyrDictAreaProposalNames.h"

#include "areacalc/objects/ZyrDictStandardRecord.h"
#include "platform/base/obj/ZyrClassId.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDictAreaProposalNames, ZyrDict, 0, nullptr, 28993,
                            ZyrRxClassDecorator::kNoText)

ZyrDictAreaProposalNames::ZyrDictAreaProposalNames(HsDbDatabase* database)
    : ZyrDict(kDictionaryName, Zyr::classNameToClass(L"ZyrDbAreaProposalNames"), nullptr, true,
              database) {}

ZyrDictAreaProposalNames::~ZyrDictAreaProposalNames() = default;

HsDbObjectId ZyrDictAreaProposalNames::getStandardAreaProposalNames(HsDbDatabase* database) {
    return Zyr::standardRecordOf<ZyrDictAreaProposalNames>(database);
}
