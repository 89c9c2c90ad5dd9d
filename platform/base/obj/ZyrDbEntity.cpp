#include "platform/base/obj/ZyrDbEntity.h"

#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/obj/ZyrImpEnt.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/base/obj/ZyrOverride.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/base/zyrtl/zyrtlDelete.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>
#include <memory>

HSRX_DEFINE_MEMBERS(ZyrDbEntity, HsDbEntity, 0, hsrxInstantiateClass<ZyrDbEntity>)

namespace {

using OwnedOverrides = std::vector<std::unique_ptr<ZyrOverride>>;

} // namespace

ZyrDbEntity::ZyrDbEntity(bool createImp) {
    if (createImp)
        replaceImp(new ZyrImpEnt);
}

ZyrDbEntity::~ZyrDbEntity() {
    deleteOverrides();
}

Hsys::ErrorStatus ZyrDbEntity::copyFrom(const HsRxObject* other) {
    if (other == nullptr)
        return Hsys::eNullPointer;
    const ZyrDbEntity* source = ZyrDbEntity::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    assertWriteEnabled();
    OwnedOverrides copies;
    for (const ZyrOverride* override : source->m_overrides) {
        copies.emplace_back(ZyrOverride::cast(override->clone()));
        if (copies.back() == nullptr)
            return Hsys::eBadArgument;
    }
    if (const Hsys::ErrorStatus status = copyImpFrom(*source); status != Hsys::eSuccess)
        return status;
    deleteOverrides();
    m_overrides = zyrtl::releaseAll(copies);
    for (ZyrOverride* override : m_overrides)
        override->setParent(static_cast<HsDbObject*>(this));
    recordReferencesModified();
    return Hsys::eSuccess;
}

void ZyrDbEntity::subSetDatabaseDefaults(HsDbDatabase* database) {
    HsDbEntity::subSetDatabaseDefaults(database);
    setImpDatabaseDefaults(database);
}

Hsys::ErrorStatus ZyrDbEntity::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = HsDbEntity::audit(info); status != Hsys::eSuccess)
        return status;
    Hsys::ErrorStatus result = auditImp(info);
    for (ZyrOverride* override : m_overrides)
        if (const Hsys::ErrorStatus status = override->audit(info); result == Hsys::eSuccess)
            result = status;
    return result;
}

Hsys::ErrorStatus ZyrDbEntity::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrDbEntity::desc(), [&] { return HsDbEntity::bdfInFields(filer); },
        [&] { return bdfInVersionAndImp(filer, ZyrImpEnt::desc()); },
        [&] { return bdfInOverrides(filer); });
}

Hsys::ErrorStatus ZyrDbEntity::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return HsDbEntity::bdfOutFields(filer); },
        [&] { return bdfOutVersionAndImp(filer); }, [&] { return bdfOutOverrides(filer); });
}

Hsys::ErrorStatus ZyrDbEntity::bdfOutOverrides(HsDbBdfFiler* filer) const {
    filer->writeUInt32(static_cast<std::uint32_t>(m_overrides.size()));
    for (const ZyrOverride* override : m_overrides)
        if (const Hsys::ErrorStatus status = Zyr::writeObject(
                filer, override, static_cast<unsigned short>(Zyr::kCurrentVersion));
            status != Hsys::eSuccess)
            return status;
    return filer->filerStatus();
}

// Every override is read before the list is replaced, so a stream that fails leaves the list
// as it was.
Hsys::ErrorStatus ZyrDbEntity::bdfInOverrides(HsDbBdfFiler* filer) {
    OwnedOverrides read;
    if (const Hsys::ErrorStatus status =
            Zyr::readObjectList(filer, static_cast<HsDbObject*>(this),
                                static_cast<unsigned short>(filedVersion()), read);
        status != Hsys::eSuccess)
        return status;
    deleteOverrides();
    m_overrides = zyrtl::releaseAll(read);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDbEntity::tdfInFields(HsDbTdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbEntity::tdfInFields(filer); status != Hsys::eSuccess)
        return status;
    return tdfInImp(filer);
}

Hsys::ErrorStatus ZyrDbEntity::tdfOutFields(HsDbTdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbEntity::tdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return tdfOutImp(filer);
}

Hsys::ErrorStatus ZyrDbEntity::getReferencedObjects(ZyrObjReferenceMap& map) const {
    Hsys::ErrorStatus result = ZyrDbImpOwner::getReferencedObjects(map);
    for (const ZyrOverride* override : m_overrides)
        if (const Hsys::ErrorStatus status = override->getReferencedObjects(map);
            result == Hsys::eSuccess)
            result = status;
    return result;
}

Hsys::ErrorStatus ZyrDbEntity::subGetClassID(_GUID* id) const {
    if (id == nullptr)
        return Hsys::eNullPointer;
    return Zyr::getEntityClassIdFromString(Zyr::constructClassID(isA()->name()), id);
}

std::int16_t ZyrDbEntity::ZyrBirthVersion() const {
    return Zyr::kBirthVersion;
}

std::int16_t ZyrDbEntity::ZyrCurrentVersion() const {
    return Zyr::kCurrentVersion;
}

void ZyrDbEntity::getLayerKey(ZyrRmCString& key) const {
    key.Empty();
}

HsDbObjectId ZyrDbEntity::styleId() const {
    assertReadEnabled();
    return imp() != nullptr ? imp()->styleId() : HsDbObjectId::kNull;
}

Hsys::ErrorStatus ZyrDbEntity::setStyleId(const HsDbObjectId& styleId) {
    assertWriteEnabled();
    return imp() != nullptr ? imp()->setStyleId(styleId) : Hsys::eNullPointer;
}

ZyrGeProfile* ZyrDbEntity::getProfile(const HsGePlane& plane) const {
    assertReadEnabled();
    return imp() != nullptr ? imp()->getProfile(plane) : nullptr;
}

bool ZyrDbEntity::isModelGeometry() const {
    return false;
}

void ZyrDbEntity::setImp(ZyrImpEnt* imp) {
    assertWriteEnabled();
    replaceImp(imp);
}

Hsys::ErrorStatus ZyrDbEntity::initializeStandardsAndDefaults(HsDbDatabase* database) {
    assertWriteEnabled();
    if (imp() == nullptr)
        return Hsys::eNullPointer;
    return imp()->initializeStandardsAndDefaults(database);
}

int ZyrDbEntity::overrideCount() const {
    assertReadEnabled();
    return static_cast<int>(m_overrides.size());
}

ZyrOverride* ZyrDbEntity::getOverrideAt(int index) const {
    assertReadEnabled();
    if (index < 0 || index >= static_cast<int>(m_overrides.size()))
        return nullptr;
    return m_overrides[static_cast<std::size_t>(index)];
}

Hsys::ErrorStatus ZyrDbEntity::appendOverride(ZyrOverride* override) {
    if (override == nullptr)
        return Hsys::eNullPointer;
    if (std::find(m_overrides.begin(), m_overrides.end(), override) != m_overrides.end())
        return Hsys::eAlreadyPresent;
    assertWriteEnabled();
    m_overrides.push_back(override);
    override->setParent(static_cast<HsDbObject*>(this));
    recordReferencesModified();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDbEntity::deleteOverrideAt(int index) {
    if (index < 0 || index >= static_cast<int>(m_overrides.size()))
        return Hsys::eInvalidIndex;
    assertWriteEnabled();
    const auto position = m_overrides.begin() + index;
    delete *position;
    m_overrides.erase(position);
    recordReferencesModified();
    return Hsys::eSuccess;
}

void ZyrDbEntity::deleteOverrides() {
    zyrtl::deleteItems(m_overrides);
}
