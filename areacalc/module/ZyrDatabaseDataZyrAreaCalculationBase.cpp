#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"

#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/base/app/ZyrDatabaseDataMgrDictionary.h"
#include "platform/host/db/HsDbHostApplicationServices.h"

#include <algorithm>

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDatabaseDataZyrAreaCalculationBase, ZyrDatabaseData, 80,
                            hsrxInstantiateClass<ZyrDatabaseDataZyrAreaCalculationBase>,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)

ZyrDatabaseDataZyrAreaCalculationBase*
ZyrDatabaseDataZyrAreaCalculationBase::instance(HsDbDatabase* database) {
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    ZyrDatabaseDataMgr* manager = services != nullptr ? services->databaseDataManager() : nullptr;
    if (manager == nullptr)
        return nullptr;
    if (database == nullptr)
        database = hsdbHostApplicationServices()->workingDatabase();
    return cast(manager->databaseData(database));
}

namespace {

// The entry of a key, searched from the start.
template <class Entries> auto findKey(Entries& entries, int key) {
    return std::find_if(entries.begin(), entries.end(),
                        [key](const auto& entry) { return entry.first == key; });
}

} // namespace

void ZyrDatabaseDataZyrAreaCalculationBase::dynPropEnableValue(int key, bool value) {
    const auto found = findKey(m_dynPropEnableValues, key);
    if (found != m_dynPropEnableValues.end())
        found->second = value;
    else
        m_dynPropEnableValues.emplace_back(key, value);
}

bool ZyrDatabaseDataZyrAreaCalculationBase::dynPropEnableValue(int key) const {
    const auto found = findKey(m_dynPropEnableValues, key);
    return found != m_dynPropEnableValues.end() ? found->second : true;
}
