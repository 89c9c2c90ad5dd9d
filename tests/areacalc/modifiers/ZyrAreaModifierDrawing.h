// A drawing with the module's service up (it offers the calculation algorithms) and a dictionary
// of area modifiers to add records to.
#pragma once

#include "tests/areacalc/ZyrAreaDrawing.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/modifiers/ZyrDbAreaModifier.h"
#include "areacalc/objects/ZyrDictAreaModifiers.h"

#include <initializer_list>
#include <utility>

class ZyrAreaModifierDrawing : public ZyrAreaDrawing {
public:
    static void SetUpTestSuite() {
        ZyrAreaDrawing::SetUpTestSuite();
        ZyrAreaCalculationTestModule::services();
    }

    static HsRxClass* areaAlgorithm() { return ZyrAreaCalculationAreaAlgorithm::desc(); }
    static HsRxClass* perimeterAlgorithm() { return ZyrAreaCalculationPerimeterAlgorithm::desc(); }

protected:
    void SetUp() override {
        ZyrAreaDrawing::SetUp();
        ASSERT_TRUE(ZyrDictAreaModifiers(&database).isValid(true, false));
    }

    // A modifier record of the drawing, acting on every algorithm.
    HsDbObjectId
    addModifier(const wchar_t* name, const wchar_t* formula,
                std::initializer_list<std::pair<const wchar_t*, double>> parameters = {}) {
        auto* modifier = new ZyrDbAreaModifier;
        EXPECT_EQ(modifier->setExpression(formula), Hsys::eSuccess);
        for (const auto& [parameter, value] : parameters)
            EXPECT_EQ(modifier->addParameter(parameter, value), Hsys::eSuccess);
        HsDbObjectId id;
        EXPECT_EQ(ZyrDictAreaModifiers(&database).addNewRecord(name, modifier, id), Hsys::eSuccess);
        modifier->close();
        return id;
    }
};
