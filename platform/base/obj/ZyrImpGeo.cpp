#include "platform/base/obj/ZyrImpGeo.h"

#include "platform/base/obj/ZyrExtentsOptions.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/base/obj/ZyrScaleInfo.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"
#include "platform/host/rx/HsRxClass.h"

#include <cmath>

HSRX_DEFINE_MEMBERS(ZyrImpGeo, ZyrImpEnt, 0, hsrxInstantiateClass<ZyrImpGeo>)

namespace {

constexpr int kMatrixSize = 4;

// A matrix an object can be placed by: finite numbers, and an inverse to take points back.
bool isPlacement(const HsGeMatrix3d& matrix) {
    for (int row = 0; row < kMatrixSize; ++row)
        for (int column = 0; column < kMatrixSize; ++column)
            if (!std::isfinite(matrix(row, column)))
                return false;
    return !matrix.isSingular();
}

bool sameEntries(const HsGeMatrix3d& a, const HsGeMatrix3d& b) {
    for (int row = 0; row < kMatrixSize; ++row)
        for (int column = 0; column < kMatrixSize; ++column)
            if (a(row, column) != b(row, column))
                return false;
    return true;
}

} // namespace

ZyrImpGeo::ZyrImpGeo() = default;

ZyrImpGeo::~ZyrImpGeo() = default;

Hsys::ErrorStatus ZyrImpGeo::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpEnt::copyFrom(other); status != Hsys::eSuccess)
        return status;
    const ZyrImpGeo* source = ZyrImpGeo::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    return setEcs(source->m_ecs, false);
}

Hsys::ErrorStatus ZyrImpGeo::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrImpGeo::desc(), [&] { return ZyrImpEnt::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, [&] { return bdfInOwnFields(filer); });
}

Hsys::ErrorStatus ZyrImpGeo::bdfInOwnFields(HsDbBdfFiler* filer) {
    HsGeMatrix3d ecs;
    for (int row = 0; row < kMatrixSize; ++row)
        for (int column = 0; column < kMatrixSize; ++column)
            filer->readDouble(ecs(row, column));
    if (filer->filerStatus() != Hsys::eSuccess)
        return filer->filerStatus();
    if (!isPlacement(ecs)) {
        filer->setFilerStatus(Hsys::eFilerError);
        return Hsys::eFilerError;
    }
    m_ecs = ecs;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpGeo::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrImpEnt::bdfOutFields(filer); }, [&] { return bdfOutVersion(filer); },
        [&] { return bdfOutOwnFields(filer); });
}

Hsys::ErrorStatus ZyrImpGeo::bdfOutOwnFields(HsDbBdfFiler* filer) const {
    for (int row = 0; row < kMatrixSize; ++row)
        for (int column = 0; column < kMatrixSize; ++column)
            filer->writeDouble(m_ecs(row, column));
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpGeo::scaleBy(const ZyrScaleInfo& info) {
    if (const Hsys::ErrorStatus status = ZyrImpEnt::scaleBy(info); status != Hsys::eSuccess)
        return status;
    return info.isValid() ? Hsys::eSuccess : Hsys::eBadArgument;
}

Hsys::ErrorStatus ZyrImpGeo::getWorldExtents(HsGeBoundBlock3d& block) const {
    const Hsys::ErrorStatus status = getLocalExtents(block);
    if (status == Hsys::eSuccess)
        block.transformBy(m_ecs);
    return status;
}

Hsys::ErrorStatus ZyrImpGeo::setWorldExtents(const HsGeBoundBlock3d& block) {
    HsGeBoundBlock3d local = block;
    local.transformBy(m_ecs.inverse());
    return setLocalExtents(local, ZyrExtentsOptions::sAcceptAll);
}

void ZyrImpGeo::getInsertCoordSystem(HsGeMatrix3d& matrix) const {
    matrix.setToIdentity();
}

HsDbEntity* ZyrImpGeo::getBaseCurve() const {
    return nullptr;
}

ZyrGeProfile* ZyrImpGeo::getBaseProfile(HsGeMatrix3d& ecs) {
    ecs = m_ecs;
    return nullptr;
}

Hsys::ErrorStatus ZyrImpGeo::setBaseProfile(ZyrGeProfile* /*profile*/,
                                            const HsGeMatrix3d& /*ecs*/) {
    return Hsys::eDoesNotApply;
}

Hsys::ErrorStatus ZyrImpGeo::setEcs(const HsGeMatrix3d& ecs, bool validate) {
    if (validate && !isPlacement(ecs))
        return Hsys::eBadArgument;
    if (sameEntries(ecs, m_ecs))
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_ecs = ecs;
    return Hsys::eSuccess;
}
