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

struct Directive {
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
            Directive directive;
            p = parse(p, directive);
            if (!convert(directive))
                m_out.append(start, p);
        }
        return m_out;
    }

private:
    const wchar_t* parse(const wchar_t* p, Directive& directive) {
        for (;; ++p) {
            if (*p == L'-')
                directive.left = true;
            else if (*p == L'+')
                directive.plus = true;
            else if (*p == L' ')
                directive.space = true;
            else if (*p == L'#')
                directive.alternate = true;
            else if (*p == L'0')
                directive.zero = true;
            else
                break;
        }
        if (*p == L'*') {
            directive.width = va_arg(m_args, int);
            if (directive.width < 0) {
                directive.left = true;
                directive.width = -directive.width;
            }
            ++p;
        } else {
            p = readNumber(p, directive.width);
        }
        if (*p == L'.') {
            ++p;
            if (*p == L'*') {
                directive.precision = va_arg(m_args, int);
                ++p;
            } else {
                directive.precision = 0;
                p = readNumber(p, directive.precision);
            }
        }
        p = parseLength(p, directive);
        if (*p != L'\0')
            directive.conversion = *p++;
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

    static const wchar_t* parseLength(const wchar_t* p, Directive& directive) {
        switch (*p) {
        case L'h':
            directive.length = p[1] == L'h' ? Length::Char : Length::Short;
            return p + (p[1] == L'h' ? 2 : 1);
        case L'l':
            directive.length = p[1] == L'l' ? Length::LongLong : Length::Long;
            return p + (p[1] == L'l' ? 2 : 1);
        case L'z': directive.length = Length::Size; return p + 1;
        case L'j': directive.length = Length::Max; return p + 1;
        case L't': directive.length = Length::Ptrdiff; return p + 1;
        case L'L': directive.length = Length::LongDouble; return p + 1;
        default: return p;
        }
    }

    // False when the conversion is unknown; the caller then copies the directive through.
    bool convert(const Directive& directive) {
        switch (directive.conversion) {
        case L'%': m_out += L'%'; return true;
        case L'd':
        case L'i': signedInteger(directive); return true;
        case L'u':
        case L'o':
        case L'x':
        case L'X': unsignedInteger(directive); return true;
        case L'f':
        case L'F':
        case L'e':
        case L'E':
        case L'g':
        case L'G': floating(directive); return true;
        case L's': text(directive, directive.length == Length::Short); return true;
        case L'S': text(directive, directive.length != Length::Long); return true;
        case L'c': character(directive, directive.length == Length::Short); return true;
        case L'C': character(directive, directive.length != Length::Long); return true;
        case L'p': pointer(directive); return true;
        case L'n': return true;
        default: return false;
        }
    }

    void signedInteger(const Directive& directive) {
        long long value = 0;
        switch (directive.length) {
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
        emitInteger(directive, magnitude, 10, false, signOf(directive, negative), L"");
    }

    void unsignedInteger(const Directive& directive) {
        unsigned long long value = 0;
        switch (directive.length) {
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
        const bool hex = directive.conversion == L'x' || directive.conversion == L'X';
        const int base = hex ? 16 : directive.conversion == L'o' ? 8 : 10;
        const wchar_t* prefix = L"";
        if (directive.alternate && value != 0 && hex)
            prefix = directive.conversion == L'x' ? L"0x" : L"0X";
        else if (directive.alternate && base == 8)
            prefix = L"0";
        emitInteger(directive, value, base, directive.conversion == L'X', L"", prefix);
    }

    static const wchar_t* signOf(const Directive& directive, bool negative) {
        if (negative)
            return L"-";
        if (directive.plus)
            return L"+";
        return directive.space ? L" " : L"";
    }

    void emitInteger(const Directive& directive, unsigned long long value, int base, bool upper,
                     const wchar_t* sign, const wchar_t* prefix) {
        char buffer[72];
        auto result = std::to_chars(buffer, buffer + sizeof buffer, value, base);
        std::wstring digits(buffer, result.ptr);
        if (upper)
            for (auto& c : digits)
                c = static_cast<wchar_t>(std::towupper(static_cast<wint_t>(c)));
        if (directive.precision == 0 && value == 0)
            digits.clear();
        if (directive.precision > 0 && digits.size() < static_cast<size_t>(directive.precision))
            digits.insert(0, static_cast<size_t>(directive.precision) - digits.size(), L'0');
        if (*prefix == L'0' && prefix[1] == L'\0' && !digits.empty() && digits[0] == L'0')
            prefix = L"";
        // A precision on an integer overrides the zero flag, as in C.
        emitNumber(directive, std::wstring(sign) + prefix, digits, directive.precision < 0);
    }

    void floating(const Directive& directive) {
        const long double wide =
            directive.length == Length::LongDouble ? va_arg(m_args, long double) : va_arg(m_args, double);
        const double value = static_cast<double>(wide);
        const int precision = directive.precision < 0 ? 6 : directive.precision;
        std::chars_format format = std::chars_format::general;
        switch (directive.conversion) {
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
        if (std::iswupper(static_cast<wint_t>(directive.conversion)))
            for (auto& c : digits)
                c = static_cast<wchar_t>(std::towupper(static_cast<wint_t>(c)));
        const bool finite = std::isfinite(value);
        emitNumber(directive, signOf(directive, std::signbit(value) && !std::isnan(value)), digits, finite);
    }

    void emitNumber(const Directive& directive, const std::wstring& head, const std::wstring& digits,
                    bool zeroPadAllowed) {
        const size_t length = head.size() + digits.size();
        const size_t pad = static_cast<size_t>(directive.width) > length ? directive.width - length : 0;
        if (directive.left) {
            m_out += head + digits;
            m_out.append(pad, L' ');
        } else if (directive.zero && zeroPadAllowed) {
            m_out += head;
            m_out.append(pad, L'0');
            m_out += digits;
        } else {
            m_out.append(pad, L' ');
            m_out += head + digits;
        }
    }

    void text(const Directive& directive, bool narrow) {
        std::wstring value;
        if (narrow) {
            const char* s = va_arg(m_args, const char*);
            value = s == nullptr ? L"(null)" : hsutFromUtf8(s);
        } else {
            const wchar_t* s = va_arg(m_args, const wchar_t*);
            value = s == nullptr ? L"(null)" : s;
        }
        if (directive.precision >= 0 && value.size() > static_cast<size_t>(directive.precision))
            value.resize(static_cast<size_t>(directive.precision));
        pad(directive, value);
    }

    void character(const Directive& directive, bool narrow) {
        // Both kinds arrive promoted: a narrow char as int, a wchar_t as wint_t.
        wchar_t c = narrow ? static_cast<wchar_t>(static_cast<unsigned char>(va_arg(m_args, int)))
                           : static_cast<wchar_t>(va_arg(m_args, wint_t));
        pad(directive, std::wstring(1, c));
    }

    void pointer(const Directive& directive) {
        const auto value = reinterpret_cast<uintptr_t>(va_arg(m_args, void*));
        Directive hex = directive;
        hex.conversion = L'x';
        emitInteger(hex, value, 16, false, L"", L"0x");
    }

    void pad(const Directive& directive, const std::wstring& value) {
        const size_t padding = static_cast<size_t>(directive.width) > value.size() ? directive.width - value.size() : 0;
        if (!directive.left)
            m_out.append(padding, L' ');
        m_out += value;
        if (directive.left)
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
