#include "platform/host/ut/HsutFormat.h"

#include "platform/host/ut/HsutUtf8.h"

#include <charconv>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <cwchar>
#include <cwctype>
#include <string_view>

namespace {

enum class Length { None, Char, Short, Long, LongLong, Size, Max, Ptrdiff, LongDouble };

struct Spec {
    bool left = false;
    bool plus = false;
    bool space = false;
    bool alternate = false;
    bool zero = false;
    int width = 0;
    int precision = -1;
    Length length = Length::None;
    wchar_t conversion = 0;
};

class Formatter {
public:
    Formatter(const wchar_t* format, va_list args) : m_format(format) { va_copy(m_args, args); }
    ~Formatter() { va_end(m_args); }
    Formatter(const Formatter&) = delete;
    Formatter& operator=(const Formatter&) = delete;

    std::wstring run() {
        if (m_format == nullptr)
            return m_out;
        const wchar_t* p = m_format;
        while (*p != L'\0') {
            if (*p != L'%') {
                m_out += *p++;
                continue;
            }
            const wchar_t* start = p++;
            Spec spec;
            p = parse(p, spec);
            if (!convert(spec))
                m_out.append(start, p);
        }
        return m_out;
    }

private:
    const wchar_t* parse(const wchar_t* p, Spec& spec) {
        for (;; ++p) {
            if (*p == L'-')
                spec.left = true;
            else if (*p == L'+')
                spec.plus = true;
            else if (*p == L' ')
                spec.space = true;
            else if (*p == L'#')
                spec.alternate = true;
            else if (*p == L'0')
                spec.zero = true;
            else
                break;
        }
        if (*p == L'*') {
            spec.width = va_arg(m_args, int);
            if (spec.width < 0) {
                spec.left = true;
                spec.width = -spec.width;
            }
            ++p;
        } else {
            p = readNumber(p, spec.width);
        }
        if (*p == L'.') {
            ++p;
            if (*p == L'*') {
                spec.precision = va_arg(m_args, int);
                ++p;
            } else {
                spec.precision = 0;
                p = readNumber(p, spec.precision);
            }
        }
        p = parseLength(p, spec);
        if (*p != L'\0')
            spec.conversion = *p++;
        return p;
    }

    static const wchar_t* readNumber(const wchar_t* p, int& value) {
        while (*p >= L'0' && *p <= L'9') {
            if (value < 100000)
                value = value * 10 + (*p - L'0');
            ++p;
        }
        return p;
    }

    static const wchar_t* parseLength(const wchar_t* p, Spec& spec) {
        switch (*p) {
        case L'h':
            spec.length = p[1] == L'h' ? Length::Char : Length::Short;
            return p + (p[1] == L'h' ? 2 : 1);
        case L'l':
            spec.length = p[1] == L'l' ? Length::LongLong : Length::Long;
            return p + (p[1] == L'l' ? 2 : 1);
        case L'z': spec.length = Length::Size; return p + 1;
        case L'j': spec.length = Length::Max; return p + 1;
        case L't': spec.length = Length::Ptrdiff; return p + 1;
        case L'L': spec.length = Length::LongDouble; return p + 1;
        default: return p;
        }
    }

    // False when the conversion is unknown; the caller then copies the directive through.
    bool convert(const Spec& spec) {
        switch (spec.conversion) {
        case L'%': m_out += L'%'; return true;
        case L'd':
        case L'i': signedInteger(spec); return true;
        case L'u':
        case L'o':
        case L'x':
        case L'X': unsignedInteger(spec); return true;
        case L'f':
        case L'F':
        case L'e':
        case L'E':
        case L'g':
        case L'G': floating(spec); return true;
        case L's': text(spec, spec.length == Length::Short); return true;
        case L'S': text(spec, spec.length != Length::Long); return true;
        case L'c': character(spec, spec.length == Length::Short); return true;
        case L'C': character(spec, spec.length != Length::Long); return true;
        case L'p': pointer(spec); return true;
        case L'n': return true;
        default: return false;
        }
    }

    void signedInteger(const Spec& spec) {
        long long value = 0;
        switch (spec.length) {
        case Length::Char: value = static_cast<signed char>(va_arg(m_args, int)); break;
        case Length::Short: value = static_cast<short>(va_arg(m_args, int)); break;
        case Length::Long: value = va_arg(m_args, long); break;
        case Length::LongLong: value = va_arg(m_args, long long); break;
        case Length::Size: value = static_cast<long long>(va_arg(m_args, size_t)); break;
        case Length::Max: value = va_arg(m_args, intmax_t); break;
        case Length::Ptrdiff: value = va_arg(m_args, ptrdiff_t); break;
        case Length::None:
        case Length::LongDouble: value = va_arg(m_args, int); break;
        }
        const bool negative = value < 0;
        const unsigned long long magnitude =
            negative ? 0ULL - static_cast<unsigned long long>(value) : static_cast<unsigned long long>(value);
        emitInteger(spec, magnitude, 10, false, signOf(spec, negative), L"");
    }

    void unsignedInteger(const Spec& spec) {
        unsigned long long value = 0;
        switch (spec.length) {
        case Length::Char: value = static_cast<unsigned char>(va_arg(m_args, unsigned)); break;
        case Length::Short: value = static_cast<unsigned short>(va_arg(m_args, unsigned)); break;
        case Length::Long: value = va_arg(m_args, unsigned long); break;
        case Length::LongLong: value = va_arg(m_args, unsigned long long); break;
        case Length::Size: value = va_arg(m_args, size_t); break;
        case Length::Max: value = va_arg(m_args, uintmax_t); break;
        case Length::Ptrdiff: value = static_cast<unsigned long long>(va_arg(m_args, ptrdiff_t)); break;
        case Length::None:
        case Length::LongDouble: value = va_arg(m_args, unsigned); break;
        }
        const bool hex = spec.conversion == L'x' || spec.conversion == L'X';
        const int base = hex ? 16 : spec.conversion == L'o' ? 8 : 10;
        const wchar_t* prefix = L"";
        if (spec.alternate && value != 0 && hex)
            prefix = spec.conversion == L'x' ? L"0x" : L"0X";
        else if (spec.alternate && base == 8)
            prefix = L"0";
        emitInteger(spec, value, base, spec.conversion == L'X', L"", prefix);
    }

    static const wchar_t* signOf(const Spec& spec, bool negative) {
        if (negative)
            return L"-";
        if (spec.plus)
            return L"+";
        return spec.space ? L" " : L"";
    }

    void emitInteger(const Spec& spec, unsigned long long value, int base, bool upper,
                     const wchar_t* sign, const wchar_t* prefix) {
        char buffer[72];
        auto result = std::to_chars(buffer, buffer + sizeof buffer, value, base);
        std::wstring digits(buffer, result.ptr);
        if (upper)
            for (auto& c : digits)
                c = static_cast<wchar_t>(std::towupper(static_cast<wint_t>(c)));
        if (spec.precision == 0 && value == 0)
            digits.clear();
        if (spec.precision > 0 && digits.size() < static_cast<size_t>(spec.precision))
            digits.insert(0, static_cast<size_t>(spec.precision) - digits.size(), L'0');
        if (*prefix == L'0' && prefix[1] == L'\0' && !digits.empty() && digits[0] == L'0')
            prefix = L"";
        // A precision on an integer overrides the zero flag, as in C.
        emitNumber(spec, std::wstring(sign) + prefix, digits, spec.precision < 0);
    }

    void floating(const Spec& spec) {
        const long double wide =
            spec.length == Length::LongDouble ? va_arg(m_args, long double) : va_arg(m_args, double);
        const double value = static_cast<double>(wide);
        const int precision = spec.precision < 0 ? 6 : spec.precision;
        std::chars_format format = std::chars_format::general;
        switch (spec.conversion) {
        case L'f':
        case L'F': format = std::chars_format::fixed; break;
        case L'e':
        case L'E': format = std::chars_format::scientific; break;
        default: break;
        }
        char buffer[400];
        const double magnitude = std::signbit(value) ? -value : value;
        auto result = std::to_chars(buffer, buffer + sizeof buffer, magnitude, format,
                                    format == std::chars_format::general && precision == 0 ? 1 : precision);
        std::wstring digits = result.ec == std::errc() ? std::wstring(buffer, result.ptr) : L"?";
        if (std::iswupper(static_cast<wint_t>(spec.conversion)))
            for (auto& c : digits)
                c = static_cast<wchar_t>(std::towupper(static_cast<wint_t>(c)));
        const bool finite = std::isfinite(value);
        emitNumber(spec, signOf(spec, std::signbit(value) && !std::isnan(value)), digits, finite);
    }

    void emitNumber(const Spec& spec, const std::wstring& head, const std::wstring& digits,
                    bool zeroPadAllowed) {
        const size_t length = head.size() + digits.size();
        const size_t pad = static_cast<size_t>(spec.width) > length ? spec.width - length : 0;
        if (spec.left) {
            m_out += head + digits;
            m_out.append(pad, L' ');
        } else if (spec.zero && zeroPadAllowed) {
            m_out += head;
            m_out.append(pad, L'0');
            m_out += digits;
        } else {
            m_out.append(pad, L' ');
            m_out += head + digits;
        }
    }

    void text(const Spec& spec, bool narrow) {
        std::wstring value;
        if (narrow) {
            const char* s = va_arg(m_args, const char*);
            value = s == nullptr ? L"(null)" : hsutFromUtf8(s);
        } else {
            const wchar_t* s = va_arg(m_args, const wchar_t*);
            value = s == nullptr ? L"(null)" : s;
        }
        if (spec.precision >= 0 && value.size() > static_cast<size_t>(spec.precision))
            value.resize(static_cast<size_t>(spec.precision));
        pad(spec, value);
    }

    void character(const Spec& spec, bool narrow) {
        // Both kinds arrive promoted: a narrow char as int, a wchar_t as wint_t.
        wchar_t c = narrow ? static_cast<wchar_t>(static_cast<unsigned char>(va_arg(m_args, int)))
                           : static_cast<wchar_t>(va_arg(m_args, wint_t));
        pad(spec, std::wstring(1, c));
    }

    void pointer(const Spec& spec) {
        const auto value = reinterpret_cast<uintptr_t>(va_arg(m_args, void*));
        Spec hex = spec;
        hex.conversion = L'x';
        emitInteger(hex, value, 16, false, L"", L"0x");
    }

    void pad(const Spec& spec, const std::wstring& value) {
        const size_t padding = static_cast<size_t>(spec.width) > value.size() ? spec.width - value.size() : 0;
        if (!spec.left)
            m_out.append(padding, L' ');
        m_out += value;
        if (spec.left)
            m_out.append(padding, L' ');
    }

    const wchar_t* m_format;
    va_list m_args;
    std::wstring m_out;
};

} // namespace

std::wstring hsutVFormat(const wchar_t* format, va_list args) {
    return Formatter(format, args).run();
}

std::wstring hsutFormat(const wchar_t* format, ...) {
    va_list args;
    va_start(args, format);
    std::wstring result = hsutVFormat(format, args);
    va_end(args);
    return result;
}
