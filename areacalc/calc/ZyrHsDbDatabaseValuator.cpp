#include "areacalc/calc/ZyrHsDbDatabaseValuator.h"

#include "platform/base/app/ZyrHdxEquipment.h"

ZyrHsDbDatabaseValuator::~ZyrHsDbDatabaseValuator() = default;

bool ZyrHsDbDatabaseValuatorDisplaySystem::isDatabaseValid(HsDbDatabase* database) const {
    return ZyrHdxEquipment::isRegularDictionaryInitialized(L"ZYR_DISP_REPS", database);
}
