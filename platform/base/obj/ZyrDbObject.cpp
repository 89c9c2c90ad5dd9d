#include "platform/base/obj/ZyrDbObject.h"

#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrDbObject, HsDbObject, 0, hsrxInstantiateClass<ZyrDbObject>)

ZyrDbObject::ZyrDbObject(bool createImp) {
    if (createImp)
        replaceImp(new ZyrImpObj);
}

ZyrDbObject::~ZyrDbObject() = default;

Hsys::ErrorStatus ZyrDbObject::copyFrom(const HsRxObject* other) {
    if (other == nullptr)
        return Hsys::eNullPointer;
    const ZyrDbObject* source = ZyrDbObject::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    assertWriteEnabled();
    const Hsys::ErrorStatus status = copyImpFrom(*source);
    recordReferencesModified();
    return status;
}

void ZyrDbObject::subSetDatabaseDefaults(HsDbDatabase* database) {
    HsDbObject::subSetDatabaseDefaults(database);
    setImpDatabaseDefaults(database);
}

Hsys::ErrorStatus ZyrDbObject::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = HsDbObject::audit(info); status != Hsys::eSuccess)
        return status;
    return auditImp(info);
}

Hsys::ErrorStatus ZyrDbObject::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrDbObject::desc(), [&] { return HsDbObject::bdfInFields(filer); },
        [&] { return bdfInVersionAndImp(filer, ZyrImpObj::desc()); }, Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrDbObject::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return HsDbObject::bdfOutFields(filer); },
        [&] { return bdfOutVersionAndImp(filer); }, Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrDbObject::tdfInFields(HsDbTdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::tdfInFields(filer); status != Hsys::eSuccess)
        return status;
    return tdfInImp(filer);
}

Hsys::ErrorStatus ZyrDbObject::tdfOutFields(HsDbTdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::tdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return tdfOutImp(filer);
}

Hsys::ErrorStatus ZyrDbObject::subGetClassID(_GUID* id) const {
    if (id == nullptr)
        return Hsys::eNullPointer;
    return Zyr::getObjectClassIdFromString(Zyr::constructClassID(isA()->name()), id);
}

std::int16_t ZyrDbObject::ZyrBirthVersion() const {
    return Zyr::kBirthVersion;
}

std::int16_t ZyrDbObject::ZyrCurrentVersion() const {
    return Zyr::kCurrentVersion;
}

void ZyrDbObject::setImp(ZyrImpObj* imp) {
    assertWriteEnabled();
    replaceImp(imp);
}

Hsys::ErrorStatus ZyrDbObject::initializeStandardsAndDefaults(HsDbDatabase* database) {
    assertWriteEnabled();
    if (imp() == nullptr)
        return Hsys::eNullPointer;
    return imp()->initializeStandardsAndDefaults(database);
}
