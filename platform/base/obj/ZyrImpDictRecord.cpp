#include "platform/base/obj/ZyrImpDictRecord.h"

#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrImpDictRecord, ZyrImpObj, 0, hsrxInstantiateClass<ZyrImpDictRecord>)

ZyrImpDictRecord::ZyrImpDictRecord() = default;

ZyrImpDictRecord::~ZyrImpDictRecord() = default;

Hsys::ErrorStatus ZyrImpDictRecord::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpObj::copyFrom(other); status != Hsys::eSuccess)
        return status;
    const ZyrImpDictRecord* source = ZyrImpDictRecord::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_name = source->m_name;
    m_description = source->m_description;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpDictRecord::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrImpDictRecord::desc(), [&] { return ZyrImpObj::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, [&] { return bdfInOwnFields(filer); });
}

Hsys::ErrorStatus ZyrImpDictRecord::bdfInOwnFields(HsDbBdfFiler* filer) {
    ZyrRmCString name;
    ZyrRmCString description;
    Zyr::bdfReadItem(filer, name);
    Zyr::bdfReadItem(filer, description);
    if (filer->filerStatus() != Hsys::eSuccess)
        return filer->filerStatus();
    m_name = name;
    m_description = description;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpDictRecord::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrImpObj::bdfOutFields(filer); }, [&] { return bdfOutVersion(filer); },
        [&] { return bdfOutOwnFields(filer); });
}

Hsys::ErrorStatus ZyrImpDictRecord::bdfOutOwnFields(HsDbBdfFiler* filer) const {
    Zyr::bdfWriteItem(filer, m_name);
    Zyr::bdfWriteItem(filer, m_description);
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpDictRecord::setName(const ZyrRmCString& name) {
    return setText(m_name, name);
}

Hsys::ErrorStatus ZyrImpDictRecord::setDescription(const ZyrRmCString& description) {
    return setText(m_description, description);
}

Hsys::ErrorStatus ZyrImpDictRecord::setText(ZyrRmCString& field, const ZyrRmCString& text) {
    if (field == text)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    field = text;
    return Hsys::eSuccess;
}
