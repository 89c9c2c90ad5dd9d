#include "platform/base/obj/ZyrImpObj.h"

#include "platform/base/obj/ZyrDbImpOwner.h"
#include "platform/base/obj/ZyrEnhancedReferenceAuditInfo.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/base/obj/ZyrParamContainer.h"
#include "platform/base/obj/ZyrParamInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "platform/host/ut/HsutFormat.h"
#include "platform/host/ut/HsutUtf8.h"

HSRX_DEFINE_MEMBERS(ZyrImpObj, HsRxObject, 0, hsrxInstantiateClass<ZyrImpObj>)

namespace {

bool isBadReference(const HsDbObjectId& id) {
    return !id.isValid() || id.isErased();
}

// Calls visit with every referenced id that has no object or an erased one.
template <class Visit> void forEachBadReference(const ZyrImpObj& object, Visit visit) {
    ZyrObjReferenceMap map;
    object.getReferencedObjects(map);
    for (int i = 0; i < map.count(); ++i)
        if (isBadReference(map.at(i)->id()))
            visit(map.at(i)->id());
}

} // namespace

ZyrImpObj::ZyrImpObj() = default;

ZyrImpObj::~ZyrImpObj() = default;

Hsys::ErrorStatus ZyrImpObj::copyFrom(const HsRxObject* other) {
    if (other == nullptr)
        return Hsys::eNullPointer;
    return ZyrImpObj::cast(other) != nullptr ? Hsys::eSuccess : Hsys::eBadArgument;
}

std::int16_t ZyrImpObj::ZyrBirthVersion() const {
    return Zyr::kBirthVersion;
}

std::int16_t ZyrImpObj::ZyrCurrentVersion() const {
    return Zyr::kCurrentVersion;
}

Hsys::ErrorStatus ZyrImpObj::bdfInFields(HsDbBdfFiler* filer) {
    // The root level has no base to read first.
    return Zyr::bdfInLevel(
        filer, this, ZyrImpObj::desc(), Zyr::noOwnFields, [&] { return bdfInVersion(filer); },
        Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrImpObj::bdfOutFields(HsDbBdfFiler* filer) const {
    return bdfOutVersion(filer);
}

Hsys::ErrorStatus ZyrImpObj::tdfInFields(HsDbTdfFiler* filer) {
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpObj::tdfOutFields(HsDbTdfFiler* filer) const {
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpObj::audit(HsDbAuditInfo* info) {
    return info != nullptr ? Hsys::eSuccess : Hsys::eNullPointer;
}

void ZyrImpObj::setParent(HsDbObject* parent) {
    m_dbParent = parent;
    m_impParent = nullptr;
}

void ZyrImpObj::setParent(ZyrImpObj* parent) {
    for (const ZyrImpObj* above = parent; above != nullptr; above = above->m_impParent)
        if (above == this)
            throw HsAssertionViolation(hsutToUtf8(std::wstring(isA()->name())) +
                                       " cannot be nested below itself");
    m_impParent = parent;
    m_dbParent = nullptr;
}

Hsys::ErrorStatus ZyrImpObj::getReferencedObjects(ZyrObjReferenceMap& /*map*/) const {
    return Hsys::eSuccess;
}

ZyrRmCString ZyrImpObj::enhancedReferenceMessage(const HsDbObjectId& id) const {
    const wchar_t* why = !id.isValid()   ? L", which has no object"
                         : id.isErased() ? L", which is erased"
                                         : L"";
    return ZyrRmCString(hsutFormat(L"%s refers to %llu%s", isA()->name(),
                                   static_cast<unsigned long long>(id.handle()), why));
}

Hsys::ErrorStatus ZyrImpObj::verifyReferences(int& badCount, bool /*fix*/) {
    forEachBadReference(*this, [&badCount](const HsDbObjectId&) { ++badCount; });
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpObj::verifyReferences(ZyrEnhancedReferenceAuditInfo& info) {
    forEachBadReference(*this, [this, &info](const HsDbObjectId& id) {
        info.add(id, enhancedReferenceMessage(id));
    });
    return Hsys::eSuccess;
}

void ZyrImpObj::summaryInfo(ZyrDesc* /*desc*/) const {}

Hsys::ErrorStatus ZyrImpObj::subSetDatabaseDefaults(HsDbDatabase* /*database*/) {
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpObj::setToStandard(HsDbDatabase* /*database*/) {
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpObj::initializeStandardsAndDefaults(HsDbDatabase* database) {
    if (const Hsys::ErrorStatus status = setToStandard(database); status != Hsys::eSuccess)
        return status;
    return subSetDatabaseDefaults(database);
}

Hsys::ErrorStatus ZyrImpObj::scaleBy(const ZyrScaleInfo& /*info*/) {
    return Hsys::eSuccess;
}

HsDbDatabase* ZyrImpObj::database() const {
    const HsDbObject* parent = dbParent();
    return parent != nullptr ? parent->database() : nullptr;
}

Hsys::ErrorStatus ZyrImpObj::getMaterialComponents(HsArray<HsDbObjectId>& /*materialIds*/) const {
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpObj::setMaterialComponents(const HsArray<HsDbObjectId>& /*materialIds*/) {
    return Hsys::eDoesNotApply;
}

Hsys::ErrorStatus ZyrImpObj::parameterChanged(ZyrParamContainer& /*container*/) {
    return Hsys::eSuccess;
}

HsDbObject* ZyrImpObj::dbParent() const {
    const ZyrImpObj* top = this;
    while (top->m_impParent != nullptr)
        top = top->m_impParent;
    return top->m_dbParent;
}

void ZyrImpObj::assertParentWriteEnabled(bool autoUndo, bool recordModified) {
    if (HsDbObject* parent = dbParent())
        parent->assertWriteEnabled(autoUndo, recordModified);
}

void ZyrImpObj::assertParentReadEnabled() const {
    if (const HsDbObject* parent = dbParent())
        parent->assertReadEnabled();
}

void ZyrImpObj::recordParentReferencesModified() {
    ZyrObjRelGraph::noteReferencesModified(dbParent());
}

void ZyrImpObj::recordParameterChanged(int paramId, HsRxClass* paramClass,
                                       ZyrParamChangeFlag::Type flags, HsRxObject* object) {
    ZyrParamContainer container;
    container.add(new ZyrParamInfo(paramId, paramClass, object, flags));
    for (ZyrImpObj* level = this; level != nullptr; level = level->m_impParent)
        level->parameterChanged(container);
    if (ZyrDbImpOwner* owner = ZyrDbImpOwner::of(dbParent()))
        owner->recordParameterChanges(container);
}

Hsys::ErrorStatus ZyrImpObj::bdfOutVersion(HsDbBdfFiler* filer) const {
    return Zyr::bdfWriteVersion(filer);
}

Hsys::ErrorStatus ZyrImpObj::bdfInVersion(HsDbBdfFiler* filer) {
    return Zyr::bdfReadVersion(filer, m_filedVersion);
}
