// The override by which an entity carries its area modifiers: their ids in order of application.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/obj/ZyrOverride.h"
#include "platform/host/db/HsDbObjectId.h"

#include <cstdint>
#include <vector>

// The list may hold an id twice, and the modifier is then applied twice. An entity is expected to
// hold one such override; whoever looks for it takes the first. Its parent is the entity.
//
// Binary filing after ZyrOverride's: int16 80, then the ids as a vector of hard pointers.
class ZyrOverrideCalculationModifier : public ZyrOverride {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrOverrideCalculationModifier)

public:
    ZyrOverrideCalculationModifier();
    ~ZyrOverrideCalculationModifier() override;

    // The virtual operations, in the order of their slots.
    // ZyrImpObj's part (its failure returned); eBadArgument for a source of another class;
    // then the list.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    std::int16_t ZyrBirthVersion() const override;
    std::int16_t ZyrCurrentVersion() const override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override;
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override;
    // ZyrOverride's audit, then the ids, which must be live modifiers of the entity's drawing.
    // eAuditNoParent when the parent is no entity; eAuditErrorsNotFixed for bad ids the audit may
    // not fix; eAuditFixedErrors once they were taken out of the list.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    // The base's, then each id as a record reference; the status of the last call.
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override;

    const std::vector<HsDbObjectId>& modifiers() const { return m_modifiers; }
    // Appends without a duplicate test; eNullId for the null id.
    Hsys::ErrorStatus add(const HsDbObjectId& id);
    // Appends each non-null id in order; null ids are skipped silently.
    Hsys::ErrorStatus add(const std::vector<HsDbObjectId>& ids);
    // Replaces the list, null ids included. Asserts write whatever ids holds.
    Hsys::ErrorStatus set(const std::vector<HsDbObjectId>& ids);
    // Takes out the first occurrence; eNameNotFound when the id is not there.
    Hsys::ErrorStatus remove(const HsDbObjectId& id);
    Hsys::ErrorStatus removeAll();

private:
    // Asserts write on the entity and records that its references change.
    void beginReferenceChange();
    Hsys::ErrorStatus bdfInModifiers(HsDbBdfFiler* filer);

    std::vector<HsDbObjectId> m_modifiers;
};
