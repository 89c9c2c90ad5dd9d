// One instance for each class asked for, made on the first ask and kept until the factory dies.
#pragma once

#include <map>
#include <vector>

class HsRxClass;
class HsRxObject;

class ZyrAreaCalculationBaseSingletonFactory {
public:
    ZyrAreaCalculationBaseSingletonFactory() = default;
    ZyrAreaCalculationBaseSingletonFactory(const ZyrAreaCalculationBaseSingletonFactory&) = delete;
    ZyrAreaCalculationBaseSingletonFactory&
    operator=(const ZyrAreaCalculationBaseSingletonFactory&) = delete;
    // Deletes the instances in key order.
    ~ZyrAreaCalculationBaseSingletonFactory();

    // The one instance of the class. A class whose create() gave null keeps null and is not asked
    // again; a null class gives null and adds nothing. An exception of create() passes on and
    // nothing is stored.
    HsRxObject* instance(HsRxClass* cls);
    // Appends the classes in key order, the order of their descriptors' addresses.
    void keys(std::vector<HsRxClass*>& classes) const;

private:
    std::map<HsRxClass*, HsRxObject*> m_instances;
};
