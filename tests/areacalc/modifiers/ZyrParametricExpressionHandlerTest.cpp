// Binding the area value into a formula as text, for evaluation and for display.
#include "areacalc/modifiers/ZyrParametricExpressionHandler.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <tuple>

namespace {

using Parameters = ZyrExpressionHandler::ParameterPairVector;
// A formula, the area value and parameters bound into it, the status and result of evaluation,
// and the text it expands to.
using Case =
    std::tuple<const wchar_t*, double, Parameters, Hsys::ErrorStatus, double, const wchar_t*>;

ZyrParametricExpressionHandler handlerFor(const wchar_t* formula, double areaValue,
                                          const Parameters& parameters = {}) {
    ZyrParametricExpressionHandler handler;
    handler.setExpression(formula);
    for (const auto& [name, value] : parameters)
        handler.addParameter(name, value);
    handler.setParameterValue(areaValue);
    return handler;
}

ZyrRmCString expand(const ZyrParametricExpressionHandler& handler,
                    ZyrExpressionHandler::FormatCallback formatCB, void* data = nullptr) {
    ZyrRmCString result;
    handler.expand(result, formatCB, data);
    return result;
}

TEST(ZyrParametricExpressionHandler, evaluatesThePercentFTextAndExpandsTheCallbacksText) {
    const double failed = -777.0; // the evaluator leaves the result alone on failure
    const Case cases[] = {
        {L"_AREA_VALUE_*f+_AREA_VALUE_", 2, {{L"f", 0.5}}, Hsys::eSuccess, 3, L"2*0.5+2"},
        {L"12*3", -1e9, {}, Hsys::eSuccess, 36, L"12*3"},
        // Evaluation sees six decimals, display the value itself. Kept: evaluation must give
        // the results modifiers have always given; a user is shown the value as it is.
        {L"_AREA_VALUE_*3", 1.0 / 3, {}, Hsys::eSuccess, 0.999999, L"0.3333333333333333*3"},
        {L"_AREA_VALUE_", 1234567.1234567, {}, Hsys::eSuccess, 1234567.123457, L"1234567.1234567"},
        {L"_AREA_VALUE_*1000000", 4e-7, {}, Hsys::eSuccess, 0, L"4e-07*1000000"},
        // A negative value goes in with its sign and no parentheses. Kept: the grammar's unary
        // minus binds tighter than "^", so the bare text means what the value in parentheses
        // would ("10--3.000000" is 13, "-3.000000^2" is 9).
        {L"10-_AREA_VALUE_", -3, {}, Hsys::eSuccess, 13, L"10--3"},
        {L"_AREA_VALUE_^2", -3, {}, Hsys::eSuccess, 9, L"-3^2"},
        {L"2^-_AREA_VALUE_", 1, {}, Hsys::eSuccess, 0.5, L"2^-1"},
        // The area value is written in before parameters are bound, so a parameter of its name
        // never binds and names inside it are no names of the formula.
        {L"_AREA_VALUE_*2", 3, {{L"_AREA_VALUE_", 99}}, Hsys::eSuccess, 6, L"3*2"},
        {L"_AREA_VALUE_+AREA", 1, {{L"AREA", 7}}, Hsys::eSuccess, 8, L"1+7"},
        // Plain text replacement cuts the name out of a longer one too. Kept: the evaluator
        // must never hear of the hard-coded name, wherever it stands.
        {L"my_AREA_VALUE_*2", 3, {{L"my_AREA_VALUE_", 5}}, Hsys::eNameNotFound, failed, L"my3*2"},
        {L"_AREA_VALUE_/0", 12, {}, Hsys::eInvalidInput, failed, L"12/0"},
    };
    for (const auto& [formula, areaValue, parameters, status, evaluated, expanded] : cases) {
        const auto handler = handlerFor(formula, areaValue, parameters);
        double result = failed;
        EXPECT_EQ(handler.evaluate(result), status) << handler.lastError().str();
        EXPECT_NEAR(result, evaluated, 1e-12 * std::max(1.0, std::abs(evaluated))) << formula;
        EXPECT_EQ(expand(handler, nullptr), expanded);
        EXPECT_EQ(expand(handler, &ZyrExpressionHandler::defaultFormatCB), expanded);
        EXPECT_EQ(handler.expression(), formula) << "the stored text is never changed";
    }
}

// Writes the value with the unit that `data` names, or with "?" when there is none.
void withUnit(double value, ZyrRmCString& text, void* data) {
    text.Format(L"%g%s", value, data != nullptr ? static_cast<const wchar_t*>(data) : L"?");
}

TEST(ZyrParametricExpressionHandler, givesTheCallersDataToParametersButNotToTheAreaValue) {
    // Kept: texts already shown were written this way, so a callback copes with a null `data`
    // for the area value while the parameters get the caller's.
    const auto handler = handlerFor(L"_AREA_VALUE_*f+g", 12, {{L"f", 0.5}, {L"g", 2}});
    wchar_t unit[] = L"[m]";
    EXPECT_EQ(expand(handler, &withUnit, unit), L"12?*0.5[m]+2[m]");
}

TEST(ZyrParametricExpressionHandler, bindsItsValueThroughAConstHandlerAndCopiesItWhole) {
    std::wstring name = L"previous";
    ZyrParametricExpressionHandler::getHardCodedValueName(name);
    EXPECT_EQ(name, L"_AREA_VALUE_");

    const auto handler = handlerFor(L"_AREA_VALUE_+1", 0);
    handler.setParameterValue(4);
    double result = 0;
    ASSERT_EQ(handler.evaluate(result), Hsys::eSuccess);
    EXPECT_EQ(result, 5);

    ZyrParametricExpressionHandler copy;
    copy = handler;
    EXPECT_EQ(copy.parameterValue(), 4);
    // Assigning through the base copies the formula only; the owner copies the value.
    ZyrParametricExpressionHandler formulaOnly;
    static_cast<ZyrExpressionHandler&>(formulaOnly) = handler;
    EXPECT_EQ(formulaOnly.parameterValue(), 0.0);
    EXPECT_EQ(formulaOnly.expression(), handler.expression());
}

} // namespace
