#include "areacalc/modifiers/ZyrParametricExpressionHandler.h"

#include "platform/base/app/ZyrHdxEquipment.h"

namespace {

const wchar_t* const kHardCodedValueName = L"_AREA_VALUE_";

} // namespace

ZyrParametricExpressionHandler::~ZyrParametricExpressionHandler() = default;

void ZyrParametricExpressionHandler::getHardCodedValueName(std::wstring& name) {
    name = kHardCodedValueName;
}

// The name is replaced as plain text, before parameters are bound: the evaluator never sees it,
// so a parameter of the same name can neither bind it nor shadow the area value.
ZyrRmCString
ZyrParametricExpressionHandler::substitutedExpression(const ZyrRmCString& valueText) const {
    ZyrRmCString text = expression();
    ZyrHdxEquipment::multipleSubst(text, kHardCodedValueName, valueText);
    return text;
}

Hsys::ErrorStatus ZyrParametricExpressionHandler::evaluate(double& result) const {
    ZyrRmCString valueText;
    valueText.Format(L"%f", m_parameterValue);
    return evaluate(substitutedExpression(valueText), parameterPairVector(), result);
}

void ZyrParametricExpressionHandler::expand(ZyrRmCString& result, FormatCallback formatCB,
                                            void* data) const {
    const FormatCallback format = formatCB != nullptr ? formatCB : &defaultFormatCB;
    ZyrRmCString valueText;
    format(m_parameterValue, valueText, nullptr);
    expand(substitutedExpression(valueText), parameterPairVector(), result, format, data);
}
