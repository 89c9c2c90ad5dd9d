// The perimeter algorithm: the length of all rings of an area's profile, holes included.
#pragma once

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"

class ZyrAreaCalculationPerimeterAlgorithm : public ZyrAreaCalculationAlgorithm {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrAreaCalculationPerimeterAlgorithm)

public:
    ZyrAreaCalculationPerimeterAlgorithm();

    void displayName(ZyrRmCString& name) const override;
    // The bitmap creator is not used.
    ZyrCalculationNodeData*
    areaNodeData(HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator* creator) const override;
    // Both values zero: a group has no perimeter of its own, the calculation adds its members.
    ZyrCalculationNodeData*
    areaGroupNodeData(HsDbEntity* entity,
                      const ZyrAreaCalculationBitmapCreator* creator) const override;

    ZyrRmCString description() const;

private:
    ZyrCalculationNodeData* newRecord(const HsDbEntity* entity) const;

    ZyrResourceText m_grossName;
    ZyrResourceText m_netName;
};
