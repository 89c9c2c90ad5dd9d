// Splits formula text into tokens. The evaluator and the expansion of parameter names share it, so
// that both agree on where a name begins and ends.
#pragma once

#include <cstddef>
#include <string_view>

struct ZyrFormulaToken {
    enum class Kind {
        kEnd,             // no text left
        kNumber,          // digits with an optional fraction and exponent
        kMalformedNumber, // a number run into letters or a second point: "2a", "1.2.3", "1e"
        kName,            // words joined by spaces: "width", "_AREA_VALUE_", "room height"
        kSymbol,          // one of + - * / ^ ( ) ,
        kInvalid,         // any other single character
    };

    Kind kind = Kind::kEnd;
    size_t begin = 0;
    size_t length = 0;

    size_t end() const { return begin + length; }
    std::wstring_view in(std::wstring_view text) const { return text.substr(begin, length); }
    bool isSymbol(std::wstring_view text, wchar_t symbol) const {
        return kind == Kind::kSymbol && text[begin] == symbol;
    }
};

class ZyrFormulaLexer {
public:
    ZyrFormulaLexer() = delete;

    // The first position at or after `at` that holds no blank (space, tab, carriage return, line
    // feed), or the size of the text.
    static size_t skipBlanks(std::wstring_view text, size_t at);
    // The token that starts exactly at `at`; a kEnd token at or past the end of the text.
    static ZyrFormulaToken scan(std::wstring_view text, size_t at);
    // True when the next token at or after `at` is "(": a name before it is called, not bound.
    static bool opensCall(std::wstring_view text, size_t at);
};
