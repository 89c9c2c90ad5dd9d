#include "areacalc/module/ZyrAreaCalculationBaseSingletonFactory.h"

#include "platform/host/rx/HsRxClass.h"

#include <memory>

ZyrAreaCalculationBaseSingletonFactory::~ZyrAreaCalculationBaseSingletonFactory() {
    for (const auto& [cls, object] : m_instances)
        delete object;
}

HsRxObject* ZyrAreaCalculationBaseSingletonFactory::instance(HsRxClass* cls) {
    if (const auto found = m_instances.find(cls); found != m_instances.end())
        return found->second;
    if (cls == nullptr)
        return nullptr;
    std::unique_ptr<HsRxObject> created(cls->create());
    m_instances.emplace(cls, created.get());
    return created.release();
}

void ZyrAreaCalculationBaseSingletonFactory::keys(std::vector<HsRxClass*>& classes) const {
    for (const auto& [cls, object] : m_instances)
        classes.push_back(cls);
}
