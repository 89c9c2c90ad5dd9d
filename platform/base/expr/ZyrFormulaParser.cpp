#include "platform/base/expr/ZyrFormulaParser.h"

#include "platform/host/ut/HsutFormat.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <numbers>

using Kind = ZyrFormulaToken::Kind;

struct ZyrFormulaParser::Function {
    std::wstring_view name;
    double (*single)(double);       // a function of exactly one argument, or null
    double (*fold)(double, double); // a function of two or more arguments, folded left to right
};

ZyrFormulaParser::ZyrFormulaParser(std::wstring_view text, const Parameters& parameters)
    : m_text(text), m_parameters(parameters) {}

Hsys::ErrorStatus ZyrFormulaParser::evaluate(double& result) {
    m_token = ZyrFormulaLexer::scan(m_text, ZyrFormulaLexer::skipBlanks(m_text, 0));
    m_depth = 0;
    m_status = Hsys::eSuccess;
    m_message.clear();
    if (m_token.kind == Kind::kEnd) {
        fail(Hsys::eInvalidInput, 0, L"the formula is empty");
        return m_status;
    }
    double value = 0.0;
    if (!parseExpression(value))
        return m_status;
    if (m_token.kind != Kind::kEnd) {
        unexpected(L"an operator or the end of the formula");
        return m_status;
    }
    result = value;
    return Hsys::eSuccess;
}

const std::pair<ZyrRmCString, double>* ZyrFormulaParser::findParameter(const Parameters& parameters,
                                                                       std::wstring_view name) {
    const auto found =
        std::find_if(parameters.begin(), parameters.end(),
                     [name](const auto& parameter) { return parameter.first.str() == name; });
    return found != parameters.end() ? &*found : nullptr;
}

// expression = term { ("+" | "-") term }
bool ZyrFormulaParser::parseExpression(double& value) {
    if (!parseTerm(value))
        return false;
    while (atSymbol(L'+') || atSymbol(L'-')) {
        const ZyrFormulaToken op = m_token;
        advance();
        double right = 0.0;
        if (!parseTerm(right) || !combine(op, value, right))
            return false;
    }
    return true;
}

// term = power { ("*" | "/") power }
bool ZyrFormulaParser::parseTerm(double& value) {
    if (!parsePower(value))
        return false;
    while (atSymbol(L'*') || atSymbol(L'/')) {
        const ZyrFormulaToken op = m_token;
        advance();
        double right = 0.0;
        if (!parsePower(right) || !combine(op, value, right))
            return false;
    }
    return true;
}

// power = unary [ "^" power ]. Every nested level of the formula passes here, so the depth is
// counted here alone.
bool ZyrFormulaParser::parsePower(double& value) {
    if (m_depth >= kMaxDepth)
        return fail(Hsys::eInvalidInput, m_token.begin,
                    L"the formula nests deeper than " + std::to_wstring(kMaxDepth) + L" levels");
    ++m_depth;
    bool parsed = parseUnary(value);
    if (parsed && atSymbol(L'^')) {
        const ZyrFormulaToken op = m_token;
        advance();
        double exponent = 0.0;
        parsed = parsePower(exponent) && combine(op, value, exponent);
    }
    --m_depth;
    return parsed;
}

// unary = { "-" } primary. A loop, not recursion: a run of minus signs costs no stack.
bool ZyrFormulaParser::parseUnary(double& value) {
    bool negate = false;
    for (; atSymbol(L'-'); advance())
        negate = !negate;
    if (!parsePrimary(value))
        return false;
    if (negate)
        value = -value;
    return true;
}

bool ZyrFormulaParser::parsePrimary(double& value) {
    switch (m_token.kind) {
    case Kind::kNumber:
        return parseNumber(value);
    case Kind::kName:
        return parseName(value);
    case Kind::kMalformedNumber:
        return fail(Hsys::eInvalidInput, m_token.begin, L"malformed number " + quoted(m_token));
    case Kind::kSymbol:
        if (atSymbol(L'('))
            return parseParenthesized(value);
        break;
    case Kind::kInvalid:
    case Kind::kEnd:
        break;
    }
    return unexpected(L"a number, a name or '('");
}

// from_chars reads the "C" way whatever the process locale: "12.5" is twelve and a half even
// where the user writes 12,5.
bool ZyrFormulaParser::parseNumber(double& value) {
    std::string digits;
    digits.reserve(m_token.length);
    for (const wchar_t c : m_token.in(m_text))
        digits += static_cast<char>(c); // the lexer let only ASCII digits, '.', 'e', signs through
    double number = 0.0;
    const char* last = digits.data() + digits.size();
    const auto [end, error] = std::from_chars(digits.data(), last, number);
    if (error == std::errc::result_out_of_range)
        return fail(Hsys::eInvalidInput, m_token.begin,
                    L"number " + quoted(m_token) + L" is out of range");
    if (error != std::errc() || end != last)
        return fail(Hsys::eInvalidInput, m_token.begin, L"malformed number " + quoted(m_token));
    value = number;
    advance();
    return true;
}

bool ZyrFormulaParser::parseParenthesized(double& value) {
    advance();
    if (!parseExpression(value))
        return false;
    if (!atSymbol(L')'))
        return unexpected(L"an operator or ')'");
    advance();
    return true;
}

bool ZyrFormulaParser::parseName(double& value) {
    const ZyrFormulaToken name = m_token;
    advance();
    return atSymbol(L'(') ? parseCall(name, value) : bindName(name, value);
}

// A parameter of the user's hides the constant pi, so that evaluation and expansion, which
// replaces every parameter name, agree.
bool ZyrFormulaParser::bindName(const ZyrFormulaToken& name, double& value) {
    const std::wstring_view text = name.in(m_text);
    if (const auto* parameter = findParameter(m_parameters, text)) {
        if (!std::isfinite(parameter->second))
            return fail(Hsys::eInvalidInput, name.begin,
                        L"parameter " + quoted(name) + L" has no finite value");
        value = parameter->second;
        return true;
    }
    if (text == L"pi") {
        value = std::numbers::pi;
        return true;
    }
    return fail(Hsys::eNameNotFound, name.begin, L"unknown parameter " + quoted(name));
}

const ZyrFormulaParser::Function* ZyrFormulaParser::findFunction(std::wstring_view name) {
    static constexpr Function functions[] = {
        {L"sqrt", [](double x) { return std::sqrt(x); }, nullptr},
        {L"sin", [](double x) { return std::sin(x); }, nullptr},
        {L"cos", [](double x) { return std::cos(x); }, nullptr},
        {L"tan", [](double x) { return std::tan(x); }, nullptr},
        {L"atan", [](double x) { return std::atan(x); }, nullptr},
        {L"abs", [](double x) { return std::fabs(x); }, nullptr},
        {L"min", nullptr, [](double a, double b) { return std::min(a, b); }},
        {L"max", nullptr, [](double a, double b) { return std::max(a, b); }},
    };
    const auto found =
        std::find_if(std::begin(functions), std::end(functions),
                     [name](const Function& function) { return function.name == name; });
    return found != std::end(functions) ? found : nullptr;
}

// call = name "(" [ expression { "," expression } ] ")"
bool ZyrFormulaParser::parseCall(const ZyrFormulaToken& name, double& value) {
    const Function* function = findFunction(name.in(m_text));
    if (function == nullptr)
        return fail(Hsys::eNameNotFound, name.begin, L"unknown function " + quoted(name));
    advance();
    int count = 0;
    if (!parseArguments(*function, value, count))
        return false;
    const bool single = function->single != nullptr;
    if (single ? count != 1 : count < 2)
        return fail(Hsys::eBadArgument, name.begin,
                    L"function " + quoted(name) +
                        (single ? L" takes 1 argument" : L" takes 2 or more arguments") +
                        L", not " + std::to_wstring(count));
    if (single)
        value = function->single(value);
    return expectFinite(name, value);
}

bool ZyrFormulaParser::parseArguments(const Function& function, double& value, int& count) {
    while (!atSymbol(L')')) {
        if (count > 0) {
            if (!atSymbol(L','))
                return unexpected(L"',' or ')'");
            advance();
        }
        double argument = 0.0;
        if (!parseExpression(argument))
            return false;
        value = count == 0 || function.fold == nullptr ? argument : function.fold(value, argument);
        ++count;
    }
    advance();
    return true;
}

bool ZyrFormulaParser::combine(const ZyrFormulaToken& op, double& left, double right) {
    switch (m_text[op.begin]) {
    case L'+':
        left += right;
        break;
    case L'-':
        left -= right;
        break;
    case L'*':
        left *= right;
        break;
    case L'/':
        if (right == 0.0)
            return fail(Hsys::eInvalidInput, op.begin, L"division by zero");
        left /= right;
        break;
    case L'^':
        left = std::pow(left, right);
        break;
    }
    return expectFinite(op, left);
}

bool ZyrFormulaParser::expectFinite(const ZyrFormulaToken& origin, double value) {
    if (std::isfinite(value))
        return true;
    return fail(Hsys::eInvalidInput, origin.begin,
                L"the result of " + quoted(origin) + L" is not a finite number");
}

bool ZyrFormulaParser::fail(Hsys::ErrorStatus status, size_t offset, const std::wstring& what) {
    m_status = status;
    m_message = what + L" at position " + std::to_wstring(offset + 1);
    return false;
}

bool ZyrFormulaParser::unexpected(const wchar_t* expected) {
    return fail(Hsys::eInvalidInput, m_token.begin,
                std::wstring(L"expected ") + expected + L", found " + describe(m_token));
}

void ZyrFormulaParser::advance() {
    m_token = ZyrFormulaLexer::scan(m_text, ZyrFormulaLexer::skipBlanks(m_text, m_token.end()));
}

// Hostile text may hold a name of a million characters; a message quotes only its beginning.
std::wstring ZyrFormulaParser::quoted(const ZyrFormulaToken& token) const {
    constexpr size_t kShown = 32;
    const std::wstring_view text = token.in(m_text);
    return L"'" + std::wstring(text.substr(0, kShown)) + (text.size() > kShown ? L"...'" : L"'");
}

std::wstring ZyrFormulaParser::describe(const ZyrFormulaToken& token) const {
    if (token.kind == Kind::kEnd)
        return L"the end of the formula";
    if (token.kind != Kind::kInvalid)
        return quoted(token);
    const wchar_t c = m_text[token.begin];
    if (c > L' ' && c < 0x7F)
        return L"character " + quoted(token);
    return L"character " + hsutFormat(L"U+%04X", static_cast<unsigned>(static_cast<char32_t>(c)));
}
