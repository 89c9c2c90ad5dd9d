#include "platform/base/obj/ZyrOverride.h"

#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/base/obj/ZyrParamInfo.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrOverride, ZyrImpObj, 0, hsrxInstantiateClass<ZyrOverride>)

ZyrOverride::ZyrOverride() = default;

ZyrOverride::~ZyrOverride() = default;

Hsys::ErrorStatus ZyrOverride::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrOverride::desc(), [&] { return ZyrImpObj::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrOverride::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrImpObj::bdfOutFields(filer); }, [&] { return bdfOutVersion(filer); },
        Zyr::noOwnFields);
}

ZyrParamInfo* ZyrOverride::getParamInfo(int paramId, HsRxClass* paramClass,
                                        HsRxObject* object) const {
    return new ZyrParamInfo(paramId, paramClass != nullptr ? paramClass : isA(),
                            object != nullptr ? object : const_cast<ZyrOverride*>(this));
}
