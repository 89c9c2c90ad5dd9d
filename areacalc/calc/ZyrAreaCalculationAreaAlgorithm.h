// The area algorithm: the area of an area's profile, holes subtracted; and its working half.
#pragma once

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"

class ZyrAreaCalculationAreaAlgorithmImp;
class ZyrPrimitiveExpressionHandlerFactory;

class ZyrAreaCalculationAreaAlgorithm : public ZyrAreaCalculationAlgorithm {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrAreaCalculationAreaAlgorithm)

public:
    ZyrAreaCalculationAreaAlgorithm();
    ~ZyrAreaCalculationAreaAlgorithm() override;
    ZyrAreaCalculationAreaAlgorithm(const ZyrAreaCalculationAreaAlgorithm&) = delete;
    ZyrAreaCalculationAreaAlgorithm& operator=(const ZyrAreaCalculationAreaAlgorithm&) = delete;

    void displayName(ZyrRmCString& name) const override;
    ZyrCalculationNodeData*
    areaNodeData(HsDbEntity* entity, const ZyrAreaCalculationBitmapCreator* creator) const override;
    ZyrCalculationNodeData*
    areaGroupNodeData(HsDbEntity* entity,
                      const ZyrAreaCalculationBitmapCreator* creator) const override;

    ZyrRmCString description() const;
    ZyrAreaCalculationAreaAlgorithmImp* imp() { return m_imp; }
    const ZyrAreaCalculationAreaAlgorithmImp* imp() const { return m_imp; }
    // The formula patterns of decomposed pieces; null while the algorithm does not decompose.
    ZyrPrimitiveExpressionHandlerFactory* expressionHandlerFactory() const;

private:
    ZyrAreaCalculationAreaAlgorithmImp* m_imp;
};

// The area algorithm's work. It reads the area value of the object; it does not divide profiles
// into pieces.
class ZyrAreaCalculationAreaAlgorithmImp {
public:
    ZyrAreaCalculationAreaAlgorithmImp();
    ZyrAreaCalculationAreaAlgorithmImp(const ZyrAreaCalculationAreaAlgorithmImp&) = delete;
    ZyrAreaCalculationAreaAlgorithmImp&
    operator=(const ZyrAreaCalculationAreaAlgorithmImp&) = delete;
    virtual ~ZyrAreaCalculationAreaAlgorithmImp();

    ZyrPrimitiveExpressionHandlerFactory* expressionHandlerFactory() const { return nullptr; }
    // The area's own area as gross and net value.
    ZyrCalculationNodeData* areaNodeData(HsDbEntity* entity,
                                         const ZyrAreaCalculationBitmapCreator* creator) const;
    // Zero for gross and net, to which the calculation adds the members; neither the entity's
    // class nor the creator is looked at.
    ZyrCalculationNodeData* areaGroupNodeData(HsDbEntity* entity,
                                              const ZyrAreaCalculationBitmapCreator* creator) const;

private:
    // A record with both values zero.
    ZyrCalculationNodeData* newAreaRecord(const HsDbEntity* entity) const;

    // The records name the area algorithm's own class, whatever class derives from it.
    const ZyrRmCString m_className;
    ZyrResourceText m_grossName;
    ZyrResourceText m_netName;
};
