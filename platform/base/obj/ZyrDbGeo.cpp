#include "platform/base/obj/ZyrDbGeo.h"

#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrDbGeo, ZyrDbEntity, 0, hsrxInstantiateClass<ZyrDbGeo>)

ZyrDbGeo::ZyrDbGeo(bool createImp) : ZyrDbEntity(false) {
    if (createImp)
        replaceImp(new ZyrImpGeo);
}

ZyrDbGeo::~ZyrDbGeo() = default;

Hsys::ErrorStatus ZyrDbGeo::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrDbGeo::desc(), [&] { return ZyrDbEntity::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrDbGeo::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrDbEntity::bdfOutFields(filer); },
        [&] { return bdfOutVersion(filer); }, Zyr::noOwnFields);
}

ZyrImpGeo* ZyrDbGeo::geoImp() {
    return ZyrImpGeo::cast(imp());
}

const ZyrImpGeo* ZyrDbGeo::geoImp() const {
    return ZyrImpGeo::cast(imp());
}

HsGeMatrix3d ZyrDbGeo::ecs() const {
    assertReadEnabled();
    return geoImp() != nullptr ? geoImp()->ecs() : HsGeMatrix3d::kIdentity;
}

Hsys::ErrorStatus ZyrDbGeo::setEcs(const HsGeMatrix3d& ecs, bool validate) {
    assertWriteEnabled();
    return geoImp() != nullptr ? geoImp()->setEcs(ecs, validate) : Hsys::eNullPointer;
}
