#include "platform/base/obj/ZyrOverride.h"

#include "platform/base/obj/ZyrConvertLegacyExtendData.h"
#include "platform/base/obj/ZyrParamInfo.h"
#include "platform/base/obj/ZyrRegisterRelgraph.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrOverride, ZyrImpObj, 0, hsrxInstantiateClass<ZyrOverride>)

ZyrOverride::ZyrOverride() = default;

ZyrOverride::~ZyrOverride() = default;

Hsys::ErrorStatus ZyrOverride::bdfInFields(HsDbBdfFiler* filer) {
    ZyrRegisterRelgraph relgraph(filer, this, ZyrOverride::desc());
    ZyrConvertLegacyExtendData legacy(filer, this, ZyrOverride::desc());
    if (const Hsys::ErrorStatus status = ZyrImpObj::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = bdfInVersion(filer); status != Hsys::eSuccess)
        return status;
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrOverride::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = ZyrImpObj::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return bdfOutVersion(filer);
}

ZyrParamInfo* ZyrOverride::getParamInfo(int paramId, HsRxClass* paramClass,
                                        HsRxObject* object) const {
    return new ZyrParamInfo(paramId, paramClass != nullptr ? paramClass : isA(),
                            object != nullptr ? object : const_cast<ZyrOverride*>(this));
}
