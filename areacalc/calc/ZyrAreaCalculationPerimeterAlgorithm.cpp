#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"

#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrDbArea.h"

namespace {

constexpr unsigned int kDisplayNameText = 29006;
// The second text of the class in the class table.
constexpr unsigned int kClassTableText = 28965;
constexpr unsigned int kDescriptionText = 28983;
constexpr unsigned int kGrossNameText = 29018;
constexpr unsigned int kNetNameText = 29028;

} // namespace

ZYR_AREACALC_DEFINE_MEMBERS(ZyrAreaCalculationPerimeterAlgorithm, ZyrAreaCalculationAlgorithm, 80,
                            hsrxInstantiateClass<ZyrAreaCalculationPerimeterAlgorithm>,
                            kDisplayNameText, kClassTableText)

ZyrAreaCalculationPerimeterAlgorithm::ZyrAreaCalculationPerimeterAlgorithm()
    : m_grossName(ZyrAreaCalculationBaseApp::kAppName, kGrossNameText),
      m_netName(ZyrAreaCalculationBaseApp::kAppName, kNetNameText) {}

void ZyrAreaCalculationPerimeterAlgorithm::displayName(ZyrRmCString& name) const {
    ZyrAreaCalculationBaseApp::sStringFromResource(kDisplayNameText, name, false);
}

ZyrRmCString ZyrAreaCalculationPerimeterAlgorithm::description() const {
    return ZyrAreaCalculationBaseApp::sStringFromResource(kDescriptionText, false);
}

// The class name comes from isA(), so that a derived algorithm names itself; the area algorithm
// names its own class whatever derives from it.
ZyrCalculationNodeData*
ZyrAreaCalculationPerimeterAlgorithm::newRecord(const HsDbEntity* entity) const {
    return newNodeData(entity, className(), m_grossName, m_netName);
}

ZyrCalculationNodeData*
ZyrAreaCalculationPerimeterAlgorithm::areaNodeData(HsDbEntity* entity,
                                                   const ZyrAreaCalculationBitmapCreator*) const {
    ZyrCalculationNodeData* data = newRecord(entity);
    data->grossValue = ZyrDbArea::cast(entity)->perimeter();
    data->netValue = data->grossValue;
    return data;
}

ZyrCalculationNodeData* ZyrAreaCalculationPerimeterAlgorithm::areaGroupNodeData(
    HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator*) const {
    return newRecord(entity);
}
