#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"

#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/module/ZyrAreaCalculationBaseSingletonFactory.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/base/app/ZyrHdxEquipment.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/host/db/HsDbEntity.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrAreaCalculationAlgorithm, HsRxObject, 0, nullptr,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)

namespace {
constexpr unsigned int kAlgorithmListTitleText = 28975;
}

void ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(std::vector<HsRxClass*>& classes) {
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    if (services == nullptr)
        return;
    if (ZyrAreaCalculationBaseSingletonFactory* factory = services->algorithmFactory())
        factory->keys(classes);
}

void ZyrAreaCalculationAlgorithm::summaryAlgorithms(ZyrDesc* summary,
                                                    const std::vector<HsRxClass*>& classes) {
    ZyrRmCStringArray names;
    for (const HsRxClass* cls : classes) {
        ZyrRmCString name;
        Zyr::classTypeToDisplayName(cls, name);
        names.push_back(name);
    }
    const ZyrRmCString title =
        ZyrAreaCalculationBaseApp::sStringFromResource(kAlgorithmListTitleText, false);
    ZyrHdxEquipment::summaryInfoStringVector(summary, title, names);
}

ZyrCalculationNodeData* ZyrAreaCalculationAlgorithm::newNodeData(const HsDbEntity* entity,
                                                                 const ZyrRmCString& className,
                                                                 const ZyrResourceText& grossName,
                                                                 const ZyrResourceText& netName) {
    auto* data = new ZyrCalculationNodeData;
    data->algorithmClassName = className;
    data->grossName = grossName.text();
    data->netName = netName.text();
    data->objectId = entity->objectId();
    return data;
}

const ZyrRmCString& ZyrAreaCalculationAlgorithm::className() const {
    if (m_className.IsEmpty())
        m_className = isA()->name();
    return m_className;
}
