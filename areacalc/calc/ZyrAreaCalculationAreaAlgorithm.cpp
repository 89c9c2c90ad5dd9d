#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"

#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrDbArea.h"

namespace {

constexpr unsigned int kDisplayNameText = 29005;
// The second text of the class in the class table.
constexpr unsigned int kClassTableText = 28964;
constexpr unsigned int kDescriptionText = 28982;
constexpr unsigned int kGrossNameText = 29017;
constexpr unsigned int kNetNameText = 29027;

} // namespace

ZYR_AREACALC_DEFINE_MEMBERS(ZyrAreaCalculationAreaAlgorithm, ZyrAreaCalculationAlgorithm, 80,
                            hsrxInstantiateClass<ZyrAreaCalculationAreaAlgorithm>, kDisplayNameText,
                            kClassTableText)

ZyrAreaCalculationAreaAlgorithm::ZyrAreaCalculationAreaAlgorithm()
    : m_imp(new ZyrAreaCalculationAreaAlgorithmImp) {}

ZyrAreaCalculationAreaAlgorithm::~ZyrAreaCalculationAreaAlgorithm() {
    delete m_imp;
}

void ZyrAreaCalculationAreaAlgorithm::displayName(ZyrRmCString& name) const {
    ZyrAreaCalculationBaseApp::sStringFromResource(kDisplayNameText, name, false);
}

ZyrRmCString ZyrAreaCalculationAreaAlgorithm::description() const {
    return ZyrAreaCalculationBaseApp::sStringFromResource(kDescriptionText, false);
}

ZyrPrimitiveExpressionHandlerFactory*
ZyrAreaCalculationAreaAlgorithm::expressionHandlerFactory() const {
    return m_imp->expressionHandlerFactory();
}

ZyrCalculationNodeData* ZyrAreaCalculationAreaAlgorithm::areaNodeData(
    HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator* creator) const {
    return m_imp->areaNodeData(entity, creator);
}

ZyrCalculationNodeData* ZyrAreaCalculationAreaAlgorithm::areaGroupNodeData(
    HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator* creator) const {
    return m_imp->areaGroupNodeData(entity, creator);
}

ZyrAreaCalculationAreaAlgorithmImp::ZyrAreaCalculationAreaAlgorithmImp()
    : m_className(ZyrAreaCalculationAreaAlgorithm::desc()->name()),
      m_grossName(ZyrAreaCalculationBaseApp::kAppName, kGrossNameText),
      m_netName(ZyrAreaCalculationBaseApp::kAppName, kNetNameText) {}

ZyrAreaCalculationAreaAlgorithmImp::~ZyrAreaCalculationAreaAlgorithmImp() = default;

ZyrCalculationNodeData*
ZyrAreaCalculationAreaAlgorithmImp::newAreaRecord(const HsDbEntity* entity) const {
    return ZyrAreaCalculationAlgorithm::newNodeData(entity, m_className, m_grossName, m_netName);
}

ZyrCalculationNodeData*
ZyrAreaCalculationAreaAlgorithmImp::areaNodeData(HsDbEntity* entity,
                                                 const ZyrAreaCalculationBitmapCreator*) const {
    ZyrCalculationNodeData* data = newAreaRecord(entity);
    data->grossValue = ZyrDbArea::cast(entity)->area();
    data->netValue = data->grossValue;
    return data;
}

ZyrCalculationNodeData* ZyrAreaCalculationAreaAlgorithmImp::areaGroupNodeData(
    HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator*) const {
    return newAreaRecord(entity);
}
