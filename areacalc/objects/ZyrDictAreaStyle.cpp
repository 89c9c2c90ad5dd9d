#include "areacalc/objects/ZyrDictAreaStyle.h"

#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaStyle.h"
#include "areacalc/objects/ZyrDictStandardRecord.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDictAreaStyle, ZyrDict, 0, nullptr, 29011,
                            ZyrRxClassDecorator::kNoText)

ZyrDictAreaStyle::ZyrDictAreaStyle(HsDbDatabase* database)
    : ZyrDict(kDictionaryName, ZyrDbAreaStyle::desc(), ZyrDbArea::desc(), true, database) {}

ZyrDictAreaStyle::~ZyrDictAreaStyle() = default;

HsDbObjectId ZyrDictAreaStyle::getStandardAreaStyle(HsDbDatabase* database) {
    return Zyr::standardRecordOf<ZyrDictAreaStyle>(database);
}
