// Feeds hostile text to the formula evaluator and to the expansion of parameter names: every
// refusal must name a position, every success must be finite, and expanding a valid formula with
// the default format must keep its value to the last bit.
#include "platform/base/expr/ZyrExpressionHandler.h"

#include <bit>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

using Parameters = ZyrExpressionHandler::ParameterPairVector;

// Each byte is one code point (so "\xe4" is an umlaut), except that 0xFF takes the next four
// bytes as one wide character: surrogates, values past U+10FFFF and negative ones reach the lexer.
std::wstring toWide(const uint8_t* data, size_t size) {
    std::wstring text;
    text.reserve(size);
    for (size_t i = 0; i < size; ++i) {
        if (data[i] != 0xFF || size - i <= sizeof(int32_t)) {
            text += static_cast<wchar_t>(data[i]);
            continue;
        }
        int32_t code = 0;
        std::memcpy(&code, data + i + 1, sizeof code);
        text += static_cast<wchar_t>(code);
        i += sizeof code;
    }
    return text;
}

// An input that starts with '#' gives the value of the parameter "v" in its next eight bytes, so
// that every double, negative zero and non-finite ones included, goes through the default format.
Parameters parametersFor(const uint8_t*& data, size_t& size) {
    Parameters parameters = {{L"a", 2},
                             {L"b", -3},
                             {L"room height", 2.5},
                             {L"x1", -0.0},
                             {L"Fl\u00e4che", 1e-7},
                             {L"e5", 1e300},
                             {L"_AREA_VALUE_", 0.1 + 0.2}};
    if (size > sizeof(double) && data[0] == '#') {
        double value = 0.0;
        std::memcpy(&value, data + 1, sizeof value);
        parameters.emplace_back(L"v", value);
        data += 1 + sizeof value;
        size -= 1 + sizeof value;
    }
    return parameters;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    const Parameters parameters = parametersFor(data, size);
    const ZyrRmCString text(toWide(data, size));
    const ZyrExpressionHandler handler;
    double direct = 0.0;
    if (handler.evaluate(text, parameters, direct) != Hsys::eSuccess) {
        if (handler.lastError().Find(L" at position ") < 0)
            std::abort();
        return 0;
    }
    if (!std::isfinite(direct) || !handler.lastError().IsEmpty())
        std::abort();

    ZyrRmCString expanded;
    handler.expand(text, parameters, expanded, nullptr, nullptr);
    double again = 0.0;
    if (handler.evaluate(expanded, {}, again) != Hsys::eSuccess ||
        std::bit_cast<uint64_t>(again) != std::bit_cast<uint64_t>(direct))
        std::abort();
    return 0;
}
