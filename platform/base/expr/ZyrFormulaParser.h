// The recursive-descent evaluator behind ZyrExpressionHandler: it computes a formula while it
// parses it, with no tree in between, since every evaluation meets a freshly substituted text.
#pragma once

#include "platform/base/expr/ZyrFormulaLexer.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <string>
#include <string_view>
#include <utility>
#include <vector>

class ZyrFormulaParser {
public:
    using Parameters = std::vector<std::pair<ZyrRmCString, double>>;

    // Parentheses, function calls and chained powers nest at most this deep; deeper text is
    // refused before it can exhaust the stack.
    static constexpr int kMaxDepth = 100;

    // Both are referred to, not copied: they must outlive the parser.
    ZyrFormulaParser(std::wstring_view text, const Parameters& parameters);

    // The value of the whole text. On failure `result` is untouched and message() names the fault
    // and its position, counted in characters from 1.
    [[nodiscard]] Hsys::ErrorStatus evaluate(double& result);
    const std::wstring& message() const { return m_message; }

    // The first parameter of exactly this name, or null.
    static const std::pair<ZyrRmCString, double>* findParameter(const Parameters& parameters,
                                                                std::wstring_view name);

private:
    struct Function;
    static const Function* findFunction(std::wstring_view name);

    bool parseExpression(double& value);
    bool parseTerm(double& value);
    bool parsePower(double& value);
    bool parseUnary(double& value);
    bool parsePrimary(double& value);
    bool parseNumber(double& value);
    bool parseParenthesized(double& value);
    bool parseName(double& value);
    bool bindName(const ZyrFormulaToken& name, double& value);
    bool parseCall(const ZyrFormulaToken& name, double& value);
    bool parseArguments(const Function& function, double& value, int& count);

    bool combine(const ZyrFormulaToken& op, double& left, double right);
    bool expectFinite(const ZyrFormulaToken& origin, double value);
    bool fail(Hsys::ErrorStatus status, size_t offset, const std::wstring& what);
    bool unexpected(const wchar_t* expected);

    bool atSymbol(wchar_t symbol) const { return m_token.isSymbol(m_text, symbol); }
    void advance();
    std::wstring quoted(const ZyrFormulaToken& token) const;
    std::wstring describe(const ZyrFormulaToken& token) const;

    std::wstring_view m_text;
    const Parameters& m_parameters;
    ZyrFormulaToken m_token;
    int m_depth = 0;
    Hsys::ErrorStatus m_status = Hsys::eSuccess;
    std::wstring m_message;
};
