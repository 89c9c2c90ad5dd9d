#include "platform/base/expr/ZyrExpressionHandler.h"

#include "platform/base/expr/ZyrFormulaLexer.h"
#include "platform/base/expr/ZyrFormulaParser.h"

#include <charconv>
#include <cmath>
#include <string>
#include <string_view>

ZyrExpressionHandler::ZyrExpressionHandler(const ZyrExpressionHandler& other)
    : m_expression(other.m_expression), m_parameters(other.m_parameters) {}

ZyrExpressionHandler& ZyrExpressionHandler::operator=(const ZyrExpressionHandler& other) {
    m_expression = other.m_expression;
    m_parameters = other.m_parameters;
    return *this;
}

ZyrExpressionHandler::~ZyrExpressionHandler() = default;

Hsys::ErrorStatus ZyrExpressionHandler::evaluate(double& result) const {
    return evaluate(m_expression, m_parameters, result);
}

void ZyrExpressionHandler::expand(ZyrRmCString& result, FormatCallback formatCB, void* data) const {
    expand(m_expression, m_parameters, result, formatCB, data);
}

void ZyrExpressionHandler::addParameter(const ZyrRmCString& name, double value) {
    m_parameters.emplace_back(name, value);
}

bool ZyrExpressionHandler::removeParameter(const ZyrRmCString& name) {
    const ParameterPair* found = ZyrFormulaParser::findParameter(m_parameters, name.str());
    if (found == nullptr)
        return false;
    m_parameters.erase(m_parameters.begin() + (found - m_parameters.data()));
    return true;
}

void ZyrExpressionHandler::removeAll() {
    m_parameters.clear();
}

bool ZyrExpressionHandler::has(const ZyrRmCString& name) const {
    return ZyrFormulaParser::findParameter(m_parameters, name.str()) != nullptr;
}

Hsys::ErrorStatus ZyrExpressionHandler::setParameterValue(int index, double value) const {
    if (index < 0 || static_cast<size_t>(index) >= m_parameters.size())
        return Hsys::eInvalidIndex;
    m_parameters[static_cast<size_t>(index)].second = value;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrExpressionHandler::evaluate(const ZyrRmCString& text,
                                                 const ParameterPairVector& parameters,
                                                 double& result) const {
    ZyrFormulaParser parser(text.str(), parameters);
    const Hsys::ErrorStatus status = parser.evaluate(result);
    m_lastError = ZyrRmCString(parser.message());
    return status;
}

// Walks the text token by token with the evaluator's own lexer, so that what counts as a name
// here is exactly what the evaluator would bind.
void ZyrExpressionHandler::expand(const ZyrRmCString& text, const ParameterPairVector& parameters,
                                  ZyrRmCString& result, FormatCallback formatCB, void* data) const {
    const FormatCallback format = formatCB != nullptr ? formatCB : &defaultFormatCB;
    const std::wstring_view source = text.str();
    std::wstring expanded;
    expanded.reserve(source.size());
    for (size_t at = 0; at < source.size();) {
        const size_t start = ZyrFormulaLexer::skipBlanks(source, at);
        expanded.append(source.substr(at, start - at));
        const ZyrFormulaToken token = ZyrFormulaLexer::scan(source, start);
        const auto* parameter = token.kind == ZyrFormulaToken::Kind::kName &&
                                        !ZyrFormulaLexer::opensCall(source, token.end())
                                    ? ZyrFormulaParser::findParameter(parameters, token.in(source))
                                    : nullptr;
        if (parameter != nullptr) {
            ZyrRmCString number;
            format(parameter->second, number, data);
            expanded += number.str();
        } else {
            expanded.append(token.in(source));
        }
        at = token.end();
    }
    result = ZyrRmCString(std::move(expanded));
}

// Below 0.00001 plain digits would be mostly leading zeros, and from 10^16 on a double no longer
// holds every integer, so the trailing digits of a plain number would pretend a precision that
// is not there.
void ZyrExpressionHandler::defaultFormatCB(double value, ZyrRmCString& text, void* /*data*/) {
    const double magnitude = std::fabs(value);
    const bool plain = magnitude == 0.0 || (magnitude >= 1e-5 && magnitude < 1e16);
    char buffer[64];
    const auto written =
        std::to_chars(std::begin(buffer), std::end(buffer), value,
                      plain ? std::chars_format::fixed : std::chars_format::scientific);
    text = ZyrRmCString(std::wstring(std::begin(buffer), written.ptr));
}
