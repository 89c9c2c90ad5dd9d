#include "platform/base/obj/ZyrImpEnt.h"

#include "platform/base/obj/ZyrConvertLegacyExtendData.h"
#include "platform/base/obj/ZyrExtentsOptions.h"
#include "platform/base/obj/ZyrRegisterRelgraph.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrImpEnt, ZyrImpObj, 0, hsrxInstantiateClass<ZyrImpEnt>)

namespace {

double signedLength(const HsGeVector3d& edge, const HsGeVector3d& axis) {
    return edge.dotProduct(axis) < 0.0 ? -edge.length() : edge.length();
}

} // namespace

namespace Zyr {

void boundBlockToDims(const HsGeBoundBlock3d& block, double& x, double& y, double& z) {
    x = signedLength(block.direction1(), HsGeVector3d::kXAxis);
    y = signedLength(block.direction2(), HsGeVector3d::kYAxis);
    z = signedLength(block.direction3(), HsGeVector3d::kZAxis);
}

} // namespace Zyr

ZyrImpEnt::ZyrImpEnt() = default;

ZyrImpEnt::~ZyrImpEnt() = default;

Hsys::ErrorStatus ZyrImpEnt::bdfInFields(HsDbBdfFiler* filer) {
    ZyrRegisterRelgraph relgraph(filer, this, ZyrImpEnt::desc());
    ZyrConvertLegacyExtendData legacy(filer, this, ZyrImpEnt::desc());
    if (const Hsys::ErrorStatus status = ZyrImpObj::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = bdfInVersion(filer); status != Hsys::eSuccess)
        return status;
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpEnt::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = ZyrImpObj::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return bdfOutVersion(filer);
}

HsDbObjectId ZyrImpEnt::styleId() const {
    return HsDbObjectId::kNull;
}

Hsys::ErrorStatus ZyrImpEnt::setStyleId(const HsDbObjectId& /*styleId*/) {
    return Hsys::eDoesNotApply;
}

ZyrGeProfile* ZyrImpEnt::getProfile(const HsGePlane& /*plane*/) const {
    return nullptr;
}

Hsys::ErrorStatus ZyrImpEnt::getLocalExtents(HsGeBoundBlock3d& /*block*/) const {
    return Hsys::eDoesNotApply;
}

Hsys::ErrorStatus ZyrImpEnt::setLocalExtents(const HsGeBoundBlock3d& /*block*/, int /*options*/) {
    return Hsys::eDoesNotApply;
}

Hsys::ErrorStatus ZyrImpEnt::getWorldExtents(HsGeBoundBlock3d& block) const {
    return getLocalExtents(block);
}

Hsys::ErrorStatus ZyrImpEnt::setWorldExtents(const HsGeBoundBlock3d& block) {
    return setLocalExtents(block, ZyrExtentsOptions::sAcceptAll);
}
