#include "areacalc/calc/ZyrAreaGroupDbOperations.h"

#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "platform/base/app/ZyrEntityLayer.h"
#include "platform/host/db/HsDbHostApplicationServices.h"

#include <memory>
#include <new>

ZyrDbAreaGroup* ZyrAreaGroupDbOperations::sample(HsDbDatabase* database) {
    if (database == nullptr)
        database = hsdbHostApplicationServices()->workingDatabase();
    std::unique_ptr<ZyrDbAreaGroup> group(new (std::nothrow) ZyrDbAreaGroup);
    if (group == nullptr)
        return nullptr;
    group->initializeStandardsAndDefaults(database);
    Zyr::setLayer(group.get(), database);
    return group.release();
}
