#include "platform/base/obj/ZyrDbGeo.h"

#include "platform/base/obj/ZyrConvertLegacyExtendData.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/obj/ZyrRegisterRelgraph.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrDbGeo, ZyrDbEntity, 0, hsrxInstantiateClass<ZyrDbGeo>)

ZyrDbGeo::ZyrDbGeo(bool createImp) : ZyrDbEntity(false) {
    if (createImp)
        replaceImp(new ZyrImpGeo);
}

ZyrDbGeo::~ZyrDbGeo() = default;

Hsys::ErrorStatus ZyrDbGeo::bdfInFields(HsDbBdfFiler* filer) {
    ZyrRegisterRelgraph relgraph(filer, this, ZyrDbGeo::desc());
    ZyrConvertLegacyExtendData legacy(filer, this, ZyrDbGeo::desc());
    if (const Hsys::ErrorStatus status = ZyrDbEntity::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = bdfInVersion(filer); status != Hsys::eSuccess)
        return status;
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrDbGeo::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = ZyrDbEntity::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return bdfOutVersion(filer);
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
