#include "platform/base/obj/ZyrImpEnt.h"

#include "platform/base/obj/ZyrExtentsOptions.h"
#include "platform/base/obj/ZyrLevelFiling.h"
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
    return Zyr::bdfInLevel(
        filer, this, ZyrImpEnt::desc(), [&] { return ZyrImpObj::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, Zyr::noOwnFields);
}

Hsys::ErrorStatus ZyrImpEnt::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrImpObj::bdfOutFields(filer); }, [&] { return bdfOutVersion(filer); },
        Zyr::noOwnFields);
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
