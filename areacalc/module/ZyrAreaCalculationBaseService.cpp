#include "areacalc/module/ZyrAreaCalculationBaseService.h"

#include "areacalc/calc/ZyrHsDbDatabaseValuator.h"
#include "platform/host/db/HsDbHostApplicationServices.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrAreaCalculationBaseService, HsRxService, 0, nullptr,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)

ZyrBitmapHandle ZyrAreaCalculationBaseService::bitmap(HsDbEntity*, const HsDbObjectId&,
                                                      unsigned int, unsigned int, unsigned int) {
    return nullptr;
}

Hsys::ErrorStatus
ZyrAreaCalculationBaseService::getOpenDatabaseInfo(DatabaseInfoVector& databases, bool,
                                                   const ZyrHsDbDatabaseValuator& valuator) {
    HsDbDatabase* working = hsdbHostApplicationServices()->workingDatabase();
    if (!valuator.isDatabaseValid(working))
        return Hsys::eDoesNotApply;
    databases.emplace_back(working, L"Current Drawing");
    return Hsys::eDoesNotApply;
}
