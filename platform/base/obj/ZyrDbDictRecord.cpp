#include "platform/base/obj/ZyrDbDictRecord.h"

#include "platform/base/obj/ZyrImpDictRecord.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrDbDictRecord, ZyrDbObject, 0, hsrxInstantiateClass<ZyrDbDictRecord>)

ZyrDbDictRecord::ZyrDbDictRecord(bool createImp) : ZyrDbObject(false) {
    if (createImp)
        replaceImp(new ZyrImpDictRecord);
}

ZyrDbDictRecord::~ZyrDbDictRecord() = default;

Hsys::ErrorStatus ZyrDbDictRecord::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrDbDictRecord::desc(), [&] { return ZyrDbObject::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrDbDictRecord::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrDbObject::bdfOutFields(filer); },
        [&] { return bdfOutVersion(filer); }, Zyr::noOwnFields);
}

ZyrImpDictRecord* ZyrDbDictRecord::recordImp() {
    return ZyrImpDictRecord::cast(imp());
}

const ZyrImpDictRecord* ZyrDbDictRecord::recordImp() const {
    return ZyrImpDictRecord::cast(imp());
}

Hsys::ErrorStatus ZyrDbDictRecord::getName(ZyrRmCString& name) const {
    assertReadEnabled();
    if (recordImp() == nullptr)
        return Hsys::eNullPointer;
    name = recordImp()->name();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDbDictRecord::setName(const ZyrRmCString& name) {
    assertWriteEnabled();
    if (recordImp() == nullptr)
        return Hsys::eNullPointer;
    return recordImp()->setName(name);
}

Hsys::ErrorStatus ZyrDbDictRecord::getDescription(ZyrRmCString& description) const {
    assertReadEnabled();
    if (recordImp() == nullptr)
        return Hsys::eNullPointer;
    description = recordImp()->description();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDbDictRecord::setDescription(const ZyrRmCString& description) {
    assertWriteEnabled();
    if (recordImp() == nullptr)
        return Hsys::eNullPointer;
    return recordImp()->setDescription(description);
}
