// A calculation algorithm: a singleton that makes the node data of areas and area groups. Its
// class is its public identity, listed by groups and modifiers and compared by pointer.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/res/ZyrResourceText.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/rx/HsRxObject.h"

#include <vector>

class HsDbEntity;
class ZyrAreaCalculationBitmapCreator;
class ZyrDesc;
struct ZyrCalculationNodeData;

class ZyrAreaCalculationAlgorithm : public HsRxObject {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrAreaCalculationAlgorithm)

public:
    // The virtual operations after those of a runtime object, in the order of their slots. The
    // node data operations return a new record in every case; the caller owns it. The entity is
    // an area for areaNodeData and a group for areaGroupNodeData: the caller has made sure.
    virtual void displayName(ZyrRmCString& name) const = 0;
    virtual ZyrCalculationNodeData*
    areaNodeData(HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator* creator) const = 0;
    virtual ZyrCalculationNodeData*
    areaGroupNodeData(HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator* creator) const = 0;

    // Appends the classes of the algorithm factory in its key order, without emptying classes
    // first; nothing without services.
    static void getAvailableAlgorithm(std::vector<HsRxClass*>& classes);
    // One summary row per class, by its display name, under the title of the algorithm list.
    static void summaryAlgorithms(ZyrDesc* summary, const std::vector<HsRxClass*>& classes);

    // A new record of the entity with both values zero, keyed by className. Its texts are shared
    // with every other record of the algorithm.
    static ZyrCalculationNodeData* newNodeData(const HsDbEntity* entity,
                                               const ZyrRmCString& className,
                                               const ZyrResourceText& grossName,
                                               const ZyrResourceText& netName);

protected:
    // The name of the algorithm's class, made once: every record of the algorithm carries it.
    const ZyrRmCString& className() const;

private:
    // Filled on first use, on the main thread like every calculation.
    mutable ZyrRmCString m_className;
};
