#include "areacalc/objects/ZyrDictAreaGroupStyle.h"

#include "areacalc/objects/ZyrDbAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictStandardRecord.h"
#include "platform/base/obj/ZyrClassId.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDictAreaGroupStyle, ZyrDict, 0, nullptr, 29009,
                            ZyrRxClassDecorator::kNoText)

ZyrDictAreaGroupStyle::ZyrDictAreaGroupStyle(HsDbDatabase* database)
    : ZyrDict(kDictionaryName, ZyrDbAreaGroupStyle::desc(),
              Zyr::classNameToClass(L"ZyrDbAreaGroup"), true, database) {}

ZyrDictAreaGroupStyle::~ZyrDictAreaGroupStyle() = default;

HsDbObjectId ZyrDictAreaGroupStyle::getStandardAreaGroupStyle(HsDbDatabase* database) {
    return Zyr::standardRecordOf<ZyrDictAreaGroupStyle>(database);
}
