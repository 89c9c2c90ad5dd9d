// An accumulator for visiting groups one at a time: the sum of one value of the direct member
// areas of every group visited that allows a calculation.
#pragma once

class HsRxClass;
class ZyrDbArea;
class ZyrDbAreaGroup;

class ZyrAreaGroupCalculationFunctor {
public:
    using AreaValue = double (ZyrDbArea::*)() const;

    ZyrAreaGroupCalculationFunctor(HsRxClass* algorithmClass, AreaValue areaValue)
        : algorithmClass(algorithmClass), areaValue(areaValue) {}

    // Adds the value of each direct member area that is not erased and opens, when the group
    // allows the calculation. Child groups and modifiers are not looked at.
    void operator()(const ZyrDbAreaGroup* group);

    double sum = 0.0;
    HsRxClass* algorithmClass;
    AreaValue areaValue;
};
