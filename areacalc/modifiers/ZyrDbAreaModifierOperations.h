// Reading, changing and applying the ordered list of area modifiers that an entity carries.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsArray.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <vector>

class HsRxClass;
class ZyrDbEntity;
class ZyrDesc;
class ZyrOverrideCalculationModifier;
class ZyrStrObjIdList;

// The list lives in the entity's first ZyrOverrideCalculationModifier; the order of the list is
// the order of application. Statuses: eNotOpenForWrite for a null entity or one not open for
// write, eNullPointer for an entity without the override (or a null argument where the operation
// says so), eNullId for a null id, eNameNotFound for an id that is not in the list.
class ZyrDbAreaModifierOperations {
public:
    ZyrDbAreaModifierOperations() = delete;

    // Adds to the entity's override, making one first when there is none. A refused id leaves the
    // new override behind, empty.
    static Hsys::ErrorStatus appendModifier(ZyrDbEntity* entity, const HsDbObjectId& id);
    // The same for each id in order; the status of the last one, eSuccess for none.
    static Hsys::ErrorStatus appendModifier(ZyrDbEntity* entity,
                                            const std::vector<HsDbObjectId>& ids);
    // Takes out the first occurrence of id; the null id takes out all modifiers. An override left
    // empty is deleted from the entity, whatever the removal answered.
    static Hsys::ErrorStatus removeModifier(ZyrDbEntity* entity, const HsDbObjectId& id);
    // Replaces the list; an empty ids takes every modifier away and answers eSuccess.
    static Hsys::ErrorStatus replaceModifier(ZyrDbEntity* entity,
                                             const std::vector<HsDbObjectId>& ids);
    // The entity's modifiers in order of application. ids is assigned only when there are some:
    // come with an empty vector. eNotOpenForRead for a null entity or one not open for read.
    static Hsys::ErrorStatus modifiersFor(const ZyrDbEntity* entity,
                                          std::vector<HsDbObjectId>& ids);
    // The same as (name, id) pairs, appended to list; ids that are no modifier record of the
    // drawing's dictionary are left out. eInvalidDictionary, with an alert, when the drawing (or
    // the working drawing, for an entity in none) has no modifier dictionary; otherwise the status
    // of the last name looked up.
    static Hsys::ErrorStatus modifiersFor(const ZyrDbEntity* entity, ZyrStrObjIdList& list);
    // value through every modifier of the entity that acts on algorithmClass, in order. A modifier
    // that cannot be opened is skipped; one that fails leaves the value as it was and the walk goes
    // on. The status of the last evaluation that ran, so an earlier failure is lost behind a later
    // success. (A calculation runs its own walk, which records every step.) eNullPointer for a null
    // entity or class.
    static Hsys::ErrorStatus applyTo(const ZyrDbEntity* entity, HsRxClass* algorithmClass,
                                     double& value);
    static bool hasModifiers(const ZyrDbEntity* entity);
    // Whether every entity of a selection carries the same list, in the same order. Ids that are
    // no entity are skipped, as are those that fail to open (with an alert). The first entry sets
    // the list to compare with, and an empty one when it does not open.
    static bool equalModifiers(const HsArray<HsDbObjectId>& entities);
    // The names of the modifier records, under the heading of the modifier list.
    static void summaryModifiers(ZyrDesc* desc, const std::vector<HsDbObjectId>& ids);

private:
    static ZyrOverrideCalculationModifier* findOverride(const ZyrDbEntity* entity);
    // The entity's override, or a new one appended to it.
    static ZyrOverrideCalculationModifier* findOrAppendOverride(ZyrDbEntity* entity);
    static void deleteOverride(ZyrDbEntity* entity);
};
