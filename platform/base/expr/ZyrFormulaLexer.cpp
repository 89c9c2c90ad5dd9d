#include "platform/base/expr/ZyrFormulaLexer.h"

namespace {

using Kind = ZyrFormulaToken::Kind;

bool isBlank(wchar_t c) {
    return c == L' ' || c == L'\t' || c == L'\r' || c == L'\n';
}

bool isDigit(wchar_t c) {
    return c >= L'0' && c <= L'9';
}

// Letters are decided without the process locale: ASCII letters, the underscore, and every code
// point from U+00A1 up (umlauts, Greek, "°", "²"), so that users' own words serve as names. C1
// controls, the no-break space and surrogates stay outside, and so does a negative wchar_t.
bool isNameStart(wchar_t c) {
    if ((c >= L'a' && c <= L'z') || (c >= L'A' && c <= L'Z') || c == L'_')
        return true;
    const auto code = static_cast<char32_t>(c);
    return code >= 0xA1 && code <= 0x10FFFF && (code < 0xD800 || code > 0xDFFF);
}

bool isNameChar(wchar_t c) {
    return isNameStart(c) || isDigit(c);
}

bool isSymbol(wchar_t c) {
    return std::wstring_view(L"+-*/^(),").find(c) != std::wstring_view::npos;
}

size_t skipWhile(std::wstring_view text, size_t at, bool (*accept)(wchar_t)) {
    while (at < text.size() && accept(text[at]))
        ++at;
    return at;
}

bool startsNumber(std::wstring_view text, size_t at) {
    return isDigit(text[at]) || (text[at] == L'.' && at + 1 < text.size() && isDigit(text[at + 1]));
}

// An exponent counts only with digits behind it; otherwise "2e" stops before the "e".
size_t skipExponent(std::wstring_view text, size_t at) {
    if (at >= text.size() || (text[at] != L'e' && text[at] != L'E'))
        return at;
    size_t digits = at + 1;
    if (digits < text.size() && (text[digits] == L'+' || text[digits] == L'-'))
        ++digits;
    const size_t end = skipWhile(text, digits, isDigit);
    return end > digits ? end : at;
}

// A number that runs straight into a letter, digit or point is one malformed token, so that
// neither the evaluator nor the expansion sees a name inside "2a" or an exponent inside "1.5e".
ZyrFormulaToken scanNumber(std::wstring_view text, size_t begin) {
    size_t at = skipWhile(text, begin, isDigit);
    if (at < text.size() && text[at] == L'.')
        at = skipWhile(text, at + 1, isDigit);
    at = skipExponent(text, at);
    const auto continuesNumber = [](wchar_t c) { return isNameChar(c) || c == L'.'; };
    if (at < text.size() && continuesNumber(text[at]))
        return {Kind::kMalformedNumber, begin, skipWhile(text, at, continuesNumber) - begin};
    return {Kind::kNumber, begin, at - begin};
}

// Words separated by spaces form one name: the grammar has no two names in a row, so "room
// height" can mean nothing else. Spaces after the last word are not part of the name.
ZyrFormulaToken scanName(std::wstring_view text, size_t begin) {
    size_t end = skipWhile(text, begin, isNameChar);
    for (;;) {
        const size_t next = skipWhile(text, end, [](wchar_t c) { return c == L' '; });
        if (next == end || next >= text.size() || !isNameStart(text[next]))
            break;
        end = skipWhile(text, next, isNameChar);
    }
    return {Kind::kName, begin, end - begin};
}

} // namespace

size_t ZyrFormulaLexer::skipBlanks(std::wstring_view text, size_t at) {
    return skipWhile(text, at, isBlank);
}

ZyrFormulaToken ZyrFormulaLexer::scan(std::wstring_view text, size_t at) {
    if (at >= text.size())
        return {Kind::kEnd, text.size(), 0};
    if (startsNumber(text, at))
        return scanNumber(text, at);
    if (isNameStart(text[at]))
        return scanName(text, at);
    return {isSymbol(text[at]) ? Kind::kSymbol : Kind::kInvalid, at, 1};
}

bool ZyrFormulaLexer::opensCall(std::wstring_view text, size_t at) {
    const size_t next = skipBlanks(text, at);
    return next < text.size() && text[next] == L'(';
}
