#include "areacalc/objects/ZyrDictAreaGroupDef.h"

#include "areacalc/objects/ZyrDictStandardRecord.h"
#include "platform/base/obj/ZyrClassId.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDictAreaGroupDef, ZyrDict, 0, nullptr, 28989,
                            ZyrRxClassDecorator::kNoText)

ZyrDictAreaGroupDef::ZyrDictAreaGroupDef(HsDbDatabase* database)
    : ZyrDict(kDictionaryName, Zyr::classNameToClass(L"ZyrDbAreaGroupDef"), nullptr, true,
              database) {}

ZyrDictAreaGroupDef::~ZyrDictAreaGroupDef() = default;

HsDbObjectId ZyrDictAreaGroupDef::getStandardAreaGroupDef(HsDbDatabase* database) {
    return Zyr::standardRecordOf<ZyrDictAreaGroupDef>(database);
}
