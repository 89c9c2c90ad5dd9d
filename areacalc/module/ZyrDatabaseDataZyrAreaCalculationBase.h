// The module's transient data for one open drawing database: never filed, gone with the database.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/app/ZyrDatabaseData.h"
#include "platform/host/db/HsDbObjectId.h"

#include <utility>
#include <vector>

class ZyrDatabaseDataZyrAreaCalculationBase : public ZyrDatabaseData {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDatabaseDataZyrAreaCalculationBase)

public:
    // The packet of the database, null standing for the working database; null without the
    // module's service or its packet manager.
    static ZyrDatabaseDataZyrAreaCalculationBase* instance(HsDbDatabase* database);

    // Dynamic properties are keyed by the modules that use them. Every key is enabled until it is
    // set otherwise.
    void dynPropEnableValue(int key, bool value);
    bool dynPropEnableValue(int key) const;

    // Group ids that stand in for the owner groups of an object that has no id yet.
    std::vector<HsDbObjectId>& groupViewerTransient() { return m_groupViewerTransient; }
    const std::vector<HsDbObjectId>& groupViewerTransient() const { return m_groupViewerTransient; }

private:
    // In the order of first setting; keys are unique.
    std::vector<std::pair<int, bool>> m_dynPropEnableValues;
    std::vector<HsDbObjectId> m_groupViewerTransient;
};
