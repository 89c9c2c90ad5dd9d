// A formula over one area value: binds the hard-coded name "_AREA_VALUE_" by writing the value
// into the text before the formula goes to the evaluator.
#pragma once

#include "platform/base/expr/ZyrExpressionHandler.h"

#include <string>

class ZyrParametricExpressionHandler : public ZyrExpressionHandler {
public:
    // The text forms of the base stay reachable beside the overrides on the handler's own text.
    using ZyrExpressionHandler::evaluate;
    using ZyrExpressionHandler::expand;
    using ZyrExpressionHandler::setParameterValue;

    ZyrParametricExpressionHandler() = default;
    // Copies text, parameters and the bound value alike. An owner that assigns only through the
    // base's operator= copies the value itself.
    ZyrParametricExpressionHandler(const ZyrParametricExpressionHandler&) = default;
    ZyrParametricExpressionHandler& operator=(const ZyrParametricExpressionHandler&) = default;
    ~ZyrParametricExpressionHandler() override;

    // The area value is the input of an evaluation, so a record open for read binds it too.
    void setParameterValue(double value) const { m_parameterValue = value; }
    double parameterValue() const { return m_parameterValue; }

    static void getHardCodedValueName(std::wstring& name);

    // The formula with the area value written in as "%f" does: six decimals, whatever its size,
    // and no parentheses around it. The stored text is never changed; the status and `result`
    // are the evaluator's.
    [[nodiscard]] Hsys::ErrorStatus evaluate(double& result) const override;
    // The formula with the area value and the parameters written in through formatCB (the
    // default format when it is null). The area value's call is given a null `data`; only the
    // parameters' calls get the caller's. What a user reads can thus differ in digits from what
    // evaluate computed.
    void expand(ZyrRmCString& result, FormatCallback formatCB, void* data) const override;

private:
    // The formula's own text with the area value's name replaced by `valueText`.
    ZyrRmCString substitutedExpression(const ZyrRmCString& valueText) const;

    mutable double m_parameterValue = 0.0;
};
