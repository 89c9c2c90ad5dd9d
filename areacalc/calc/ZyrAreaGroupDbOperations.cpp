#include "areacalc/calc/ZyrAreaGroupDbOperations.h"

#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrGroupHandler.h"
#include "platform/base/app/ZyrEntityLayer.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbObjectPointer.h"

#include <memory>
#include <new>

namespace {

using LeafValue = Hsys::ErrorStatus (*)(const HsDbObjectId&, double&);

Hsys::ErrorStatus groupValue(const ZyrDbAreaGroup* group, HsRxClass* algorithmClass,
                             LeafValue leafValue, bool applyModifiers, double& result) {
    if (group == nullptr)
        return Hsys::eNullPointer;
    if (!group->algorithms().contains(algorithmClass))
        return Hsys::eSuccess;
    double sum = 0.0;
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (const HsDbObjectId& id : group->groupHandler()->leafs()) {
        if (id.isErased())
            continue;
        double local = 0.0;
        status = leafValue(id, local);
        if (status == Hsys::eSuccess)
            sum += local;
    }
    for (const HsDbObjectId& id : group->groupHandler()->nodes()) {
        if (id.isErased())
            continue;
        HsDbObjectPointer<ZyrDbAreaGroup> child(id, HsDb::kForRead);
        status = child.openStatus();
        if (status != Hsys::eSuccess)
            continue;
        double local = 0.0;
        status = groupValue(child.object(), algorithmClass, leafValue, applyModifiers, local);
        if (status == Hsys::eSuccess)
            sum += local;
    }
    if (applyModifiers)
        status = ZyrDbAreaModifierOperations::applyTo(group, algorithmClass, sum);
    result += sum;
    return status;
}

} // namespace

Hsys::ErrorStatus ZyrAreaGroupDbOperations::area(const ZyrDbAreaGroup* group, double& value) {
    return groupValue(group, ZyrAreaCalculationAreaAlgorithm::desc(), &ZyrAreaDbOperations::area,
                      false, value);
}

Hsys::ErrorStatus ZyrAreaGroupDbOperations::perimeter(const ZyrDbAreaGroup* group, double& value) {
    return groupValue(group, ZyrAreaCalculationPerimeterAlgorithm::desc(),
                      &ZyrAreaDbOperations::perimeter, false, value);
}

Hsys::ErrorStatus ZyrAreaGroupDbOperations::areaModified(const ZyrDbAreaGroup* group,
                                                         double& value) {
    return groupValue(group, ZyrAreaCalculationAreaAlgorithm::desc(),
                      &ZyrAreaDbOperations::areaModified, true, value);
}

Hsys::ErrorStatus ZyrAreaGroupDbOperations::perimeterModified(const ZyrDbAreaGroup* group,
                                                              double& value) {
    return groupValue(group, ZyrAreaCalculationPerimeterAlgorithm::desc(),
                      &ZyrAreaDbOperations::perimeterModified, true, value);
}

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
