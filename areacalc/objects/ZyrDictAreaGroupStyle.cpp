#include "areacalc/objects/ZyrDictAreaGroupStyle.h"

#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDbAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictStandardRecord.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDictAreaGroupStyle, ZyrDict, 0, nullptr, 29009,
                            ZyrRxClassDecorator::kNoText)

ZyrDictAreaGroupStyle::ZyrDictAreaGroupStyle(HsDbDatabase* database)
    : ZyrDict(kDictionaryName, ZyrDbAreaGroupStyle::desc(), ZyrDbAreaGroup::desc(), true,
              database) {}

ZyrDictAreaGroupStyle::~ZyrDictAreaGroupStyle() = default;

HsDbObjectId ZyrDictAreaGroupStyle::getStandardAreaGroupStyle(HsDbDatabase* database) {
    return Zyr::standardRecordOf<ZyrDictAreaGroupStyle>(database);
}
