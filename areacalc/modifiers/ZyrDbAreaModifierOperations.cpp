#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"

#include "areacalc/modifiers/ZyrDbAreaModifier.h"
#include "areacalc/modifiers/ZyrOverrideCalculationModifier.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrDictAreaModifiers.h"
#include "platform/base/app/ZyrHdxEquipment.h"
#include "platform/base/app/ZyrUserMessages.h"
#include "platform/base/dict/ZyrStrObjIdList.h"
#include "platform/base/obj/ZyrDbEntity.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbObjectPointer.h"

#include <algorithm>

namespace {

// The heading of the modifier list in the module's resource.
constexpr unsigned int kModifiersHeading = 28974;

bool isWritable(const ZyrDbEntity* entity) {
    return entity != nullptr && entity->isWriteEnabled();
}

// Whether the modifier acts on values of the algorithm: a linear search by pointer.
bool actsOn(const ZyrDbAreaModifier& modifier, const HsRxClass* algorithmClass) {
    const auto& algorithms = modifier.algorithms();
    return std::find(algorithms.begin(), algorithms.end(), algorithmClass) != algorithms.end();
}

} // namespace

ZyrOverrideCalculationModifier*
ZyrDbAreaModifierOperations::findOverride(const ZyrDbEntity* entity) {
    for (int i = 0; i < entity->overrideCount(); ++i)
        if (auto* found = ZyrOverrideCalculationModifier::cast(entity->getOverrideAt(i)))
            return found;
    return nullptr;
}

ZyrOverrideCalculationModifier*
ZyrDbAreaModifierOperations::findOrAppendOverride(ZyrDbEntity* entity) {
    if (ZyrOverrideCalculationModifier* found = findOverride(entity))
        return found;
    auto* made = new ZyrOverrideCalculationModifier;
    // A new override is in no list, so the entity, open for write, takes it.
    (void)entity->appendOverride(made);
    return made;
}

void ZyrDbAreaModifierOperations::deleteOverride(ZyrDbEntity* entity) {
    for (int i = 0; i < entity->overrideCount(); ++i)
        if (ZyrOverrideCalculationModifier::cast(entity->getOverrideAt(i)) != nullptr) {
            (void)entity->deleteOverrideAt(i);
            return;
        }
}

Hsys::ErrorStatus ZyrDbAreaModifierOperations::appendModifier(ZyrDbEntity* entity,
                                                              const HsDbObjectId& id) {
    if (!isWritable(entity))
        return Hsys::eNotOpenForWrite;
    return findOrAppendOverride(entity)->add(id);
}

Hsys::ErrorStatus
ZyrDbAreaModifierOperations::appendModifier(ZyrDbEntity* entity,
                                            const std::vector<HsDbObjectId>& ids) {
    if (!isWritable(entity))
        return Hsys::eNotOpenForWrite;
    ZyrOverrideCalculationModifier* attached = findOrAppendOverride(entity);
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (const HsDbObjectId& id : ids)
        status = attached->add(id);
    return status;
}

Hsys::ErrorStatus ZyrDbAreaModifierOperations::removeModifier(ZyrDbEntity* entity,
                                                              const HsDbObjectId& id) {
    if (!isWritable(entity))
        return Hsys::eNotOpenForWrite;
    ZyrOverrideCalculationModifier* attached = findOverride(entity);
    if (attached == nullptr)
        return Hsys::eNullPointer;
    if (id.isNull()) {
        deleteOverride(entity);
        return Hsys::eSuccess;
    }
    const Hsys::ErrorStatus status = attached->remove(id);
    if (attached->modifiers().empty())
        deleteOverride(entity);
    return status;
}

Hsys::ErrorStatus
ZyrDbAreaModifierOperations::replaceModifier(ZyrDbEntity* entity,
                                             const std::vector<HsDbObjectId>& ids) {
    if (entity == nullptr)
        return Hsys::eNullPointer;
    if (ids.empty()) {
        (void)removeModifier(entity, HsDbObjectId::kNull);
        return Hsys::eSuccess;
    }
    if (!entity->isWriteEnabled())
        return Hsys::eNotOpenForWrite;
    return findOrAppendOverride(entity)->set(ids);
}

Hsys::ErrorStatus ZyrDbAreaModifierOperations::modifiersFor(const ZyrDbEntity* entity,
                                                            std::vector<HsDbObjectId>& ids) {
    if (entity == nullptr || !entity->isReadEnabled())
        return Hsys::eNotOpenForRead;
    const ZyrOverrideCalculationModifier* attached = findOverride(entity);
    if (attached != nullptr && !attached->modifiers().empty())
        ids = attached->modifiers();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDbAreaModifierOperations::modifiersFor(const ZyrDbEntity* entity,
                                                            ZyrStrObjIdList& list) {
    std::vector<HsDbObjectId> ids;
    if (const Hsys::ErrorStatus status = modifiersFor(entity, ids); status != Hsys::eSuccess)
        return status;
    HsDbDatabase* database = entity->database();
    if (database == nullptr)
        database = hsdbHostApplicationServices()->workingDatabase();
    ZyrDictAreaModifiers dictionary(database);
    if (!dictionary.isValid(false, false)) {
        Zyr::rxErrorAlert(Hsys::eInvalidDictionary);
        return Hsys::eInvalidDictionary;
    }
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (const HsDbObjectId& id : ids) {
        ZyrRmCString name;
        status = dictionary.nameAt(id, name);
        if (status == Hsys::eSuccess)
            list.add(name, id);
    }
    return status;
}

Hsys::ErrorStatus ZyrDbAreaModifierOperations::applyTo(const ZyrDbEntity* entity,
                                                       HsRxClass* algorithmClass, double& value) {
    if (entity == nullptr || algorithmClass == nullptr)
        return Hsys::eNullPointer;
    std::vector<HsDbObjectId> ids;
    if (const Hsys::ErrorStatus status = modifiersFor(entity, ids); status != Hsys::eSuccess)
        return status;
    double current = value;
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (const HsDbObjectId& id : ids) {
        const HsDbObjectPointer<ZyrDbAreaModifier> modifier(id, HsDb::kForRead);
        if (!modifier || !actsOn(*modifier.object(), algorithmClass))
            continue;
        double result = 0.0;
        status = modifier->evaluateExpr(current, result);
        if (status == Hsys::eSuccess)
            current = result;
    }
    value = current;
    return status;
}

bool ZyrDbAreaModifierOperations::hasModifiers(const ZyrDbEntity* entity) {
    std::vector<HsDbObjectId> ids;
    return modifiersFor(entity, ids) == Hsys::eSuccess && !ids.empty();
}

bool ZyrDbAreaModifierOperations::equalModifiers(const HsArray<HsDbObjectId>& entities) {
    if (entities.length() < 2)
        return true;
    std::vector<HsDbObjectId> reference;
    for (int i = 0; i < entities.length(); ++i) {
        const HsDbObjectPointer<ZyrDbEntity> entity(entities.at(i), HsDb::kForRead);
        if (!entity) {
            if (entity.openStatus() != Hsys::eWrongClass)
                Zyr::alertOpenFailure(entity.openStatus(), ZyrDbEntity::desc());
            continue;
        }
        std::vector<HsDbObjectId> ids;
        (void)modifiersFor(entity.object(), ids);
        if (i == 0)
            reference = std::move(ids);
        else if (ids != reference)
            return false;
    }
    return true;
}

void ZyrDbAreaModifierOperations::summaryModifiers(ZyrDesc* desc,
                                                   const std::vector<HsDbObjectId>& ids) {
    ZyrRmCStringArray names;
    (void)ZyrHdxEquipment::convertToDictRecNames(ids, names);
    ZyrHdxEquipment::summaryInfoStringVector(
        desc, ZyrAreaCalculationBaseApp::sStringFromResource(kModifiersHeading, false), names);
}
