#include "areacalc/calc/ZyrAreaGroupCalculationFunctor.h"

#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrGroupHandler.h"
#include "platform/host/db/HsDbObjectPointer.h"

void ZyrAreaGroupCalculationFunctor::operator()(const ZyrDbAreaGroup* group) {
    if (group == nullptr || !group->algorithms().contains(algorithmClass))
        return;
    double local = 0.0;
    for (const HsDbObjectId& id : group->groupHandler()->leafs()) {
        if (id.isErased())
            continue;
        HsDbObjectPointer<ZyrDbArea> area(id, HsDb::kForRead);
        if (area)
            local += (area.object()->*areaValue)();
    }
    sum += local;
}
