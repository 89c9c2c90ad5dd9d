#include "areacalc/modifiers/ZyrOverrideCalculationModifier.h"

#include "areacalc/modifiers/ZyrDbAreaModifier.h"
#include "areacalc/objects/ZyrPairFiling.h"
#include "platform/base/relgraph/ZyrAuditUtilities.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbEntity.h"
#include "platform/host/filer/HsDbFilerSupport.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrOverrideCalculationModifier, ZyrOverride, 80,
                            hsrxInstantiateClass<ZyrOverrideCalculationModifier>,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)

ZyrOverrideCalculationModifier::ZyrOverrideCalculationModifier() = default;

ZyrOverrideCalculationModifier::~ZyrOverrideCalculationModifier() = default;

Hsys::ErrorStatus ZyrOverrideCalculationModifier::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpObj::copyFrom(other); status != Hsys::eSuccess)
        return status;
    const ZyrOverrideCalculationModifier* source = ZyrOverrideCalculationModifier::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    beginReferenceChange();
    m_modifiers = source->m_modifiers;
    return Hsys::eSuccess;
}

std::int16_t ZyrOverrideCalculationModifier::ZyrBirthVersion() const {
    return Zyr::kBirthVersion;
}

std::int16_t ZyrOverrideCalculationModifier::ZyrCurrentVersion() const {
    return Zyr::kCurrentVersion;
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrOverrideCalculationModifier::desc(),
        [&] { return ZyrOverride::bdfInFields(filer); }, [&] { return bdfInVersion(filer); },
        [&] { return bdfInModifiers(filer); });
}

// Read aside first, so that a damaged list leaves the one held.
Hsys::ErrorStatus ZyrOverrideCalculationModifier::bdfInModifiers(HsDbBdfFiler* filer) {
    std::vector<HsDbObjectId> read;
    if (const Hsys::ErrorStatus status =
            HsDbFilerSupport::bdfReadHardPointerVector(filer, read, true);
        status != Hsys::eSuccess)
        return status;
    m_modifiers = std::move(read);
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrOverride::bdfOutFields(filer); },
        [&] { return bdfOutVersion(filer); },
        [&] { return HsDbFilerSupport::bdfWriteHardPointerVector(filer, m_modifiers); });
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::tdfInFields(HsDbTdfFiler* filer) {
    return Zyr::tdfInUnlessFromFile(filer, [&] { return ZyrOverride::tdfInFields(filer); });
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::tdfOutFields(HsDbTdfFiler* filer) const {
    return Zyr::tdfOutUnlessToFile(filer, [&] { return ZyrOverride::tdfOutFields(filer); });
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::audit(HsDbAuditInfo* info) {
    const Hsys::ErrorStatus status = ZyrOverride::audit(info);
    const HsDbEntity* entity = HsDbEntity::cast(dbParent());
    if (entity == nullptr)
        return Hsys::eAuditNoParent;
    const int bad = ZyrAuditUtilities::verifySymbolReferences(
        entity, m_modifiers, ZyrDbAreaModifier::desc(), 0, 0, info->fixErrors());
    if (bad == 0)
        return status;
    info->errorsFound(bad);
    if (!info->fixErrors())
        return Hsys::eAuditErrorsNotFixed;
    info->errorsFixed(bad);
    beginReferenceChange();
    return Hsys::eAuditFixedErrors;
}

Hsys::ErrorStatus
ZyrOverrideCalculationModifier::getReferencedObjects(ZyrObjReferenceMap& map) const {
    Hsys::ErrorStatus status = ZyrOverride::getReferencedObjects(map);
    for (const HsDbObjectId& id : m_modifiers)
        status = map.addRecordReference(id);
    return status;
}

void ZyrOverrideCalculationModifier::beginReferenceChange() {
    assertParentWriteEnabled();
    recordParentReferencesModified();
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::add(const HsDbObjectId& id) {
    if (id.isNull())
        return Hsys::eNullId;
    beginReferenceChange();
    m_modifiers.push_back(id);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::add(const std::vector<HsDbObjectId>& ids) {
    if (ids.empty())
        return Hsys::eSuccess;
    beginReferenceChange();
    for (const HsDbObjectId& id : ids)
        if (!id.isNull())
            m_modifiers.push_back(id);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::set(const std::vector<HsDbObjectId>& ids) {
    beginReferenceChange();
    if (&ids != &m_modifiers)
        m_modifiers = ids;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::remove(const HsDbObjectId& id) {
    const auto found = std::find(m_modifiers.begin(), m_modifiers.end(), id);
    if (found == m_modifiers.end())
        return Hsys::eNameNotFound;
    assertParentWriteEnabled();
    m_modifiers.erase(found);
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrOverrideCalculationModifier::removeAll() {
    if (m_modifiers.empty())
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_modifiers.clear();
    recordParentReferencesModified();
    return Hsys::eSuccess;
}
