#include "platform/base/res/ZyrRmCString.h"

#include "platform/base/res/ZyrTextResources.h"
#include "platform/host/ut/HsutFormat.h"

#include <algorithm>
#include <cstdarg>
#include <cwchar>
#include <locale>
#include <map>

namespace {

std::wstring withoutMnemonics(const std::wstring& text) {
    std::wstring out;
    out.reserve(text.size());
    for (size_t i = 0; i < text.size(); ++i) {
        if (text[i] != L'&')
            out += text[i];
        else if (i + 1 < text.size() && text[i + 1] == L'&')
            out += text[++i];
    }
    return out;
}

wchar_t foldClassic(wchar_t c) {
    static const auto& ctype = std::use_facet<std::ctype<wchar_t>>(std::locale::classic());
    return ctype.tolower(c);
}

int sign(long long value) { return value < 0 ? -1 : value > 0 ? 1 : 0; }

// One positional argument of FormatMessage, formatted by its "!directive!" and taken off the list.
std::wstring formatPositional(const std::wstring& directive, va_list& args) {
    const std::wstring format = L"%" + directive;
    const wchar_t conversion = directive.empty() ? L's' : directive.back();
    const bool isLong = directive.find(L'l') != std::wstring::npos;
    const bool isLongLong = directive.find(L"ll") != std::wstring::npos;
    switch (conversion) {
    case L'd':
    case L'i':
        if (isLongLong)
            return hsutFormat(format.c_str(), va_arg(args, long long));
        if (isLong)
            return hsutFormat(format.c_str(), va_arg(args, long));
        return hsutFormat(format.c_str(), va_arg(args, int));
    case L'u':
    case L'x':
    case L'X':
    case L'o':
        if (isLongLong)
            return hsutFormat(format.c_str(), va_arg(args, unsigned long long));
        if (isLong)
            return hsutFormat(format.c_str(), va_arg(args, unsigned long));
        return hsutFormat(format.c_str(), va_arg(args, unsigned));
    case L'c': return hsutFormat(format.c_str(), va_arg(args, wint_t));
    case L'C': return hsutFormat(format.c_str(), va_arg(args, int));
    case L'f':
    case L'F':
    case L'e':
    case L'E':
    case L'g':
    case L'G': return hsutFormat(format.c_str(), va_arg(args, double));
    case L'S': return hsutFormat(format.c_str(), va_arg(args, const char*));
    case L's':
        if (directive.find(L'h') != std::wstring::npos)
            return hsutFormat(format.c_str(), va_arg(args, const char*));
        return hsutFormat(format.c_str(), va_arg(args, const wchar_t*));
    default: return hsutFormat(format.c_str(), va_arg(args, void*));
    }
}

struct Insert {
    size_t begin;
    size_t end;
    int index;
};

} // namespace

ZyrRmCString::ZyrRmCString(const wchar_t* text)
    : ZyrRmCString(std::wstring(text != nullptr ? text : L"")) {}

ZyrRmCString::ZyrRmCString(std::wstring text) {
    if (!text.empty())
        m_text = std::make_shared<std::wstring>(std::move(text));
}

ZyrRmCString::ZyrRmCString(const wchar_t* appName, unsigned int id, bool stripMnemonics) {
    const std::wstring_view app = appName != nullptr ? appName : L"";
    const ZyrRmCString* text = ZyrTextResources::find(app, id);
    if (text == nullptr)
        *this = ZyrTextResources::placeholder(app, id);
    else
        *this = stripMnemonics ? ZyrRmCString(withoutMnemonics(text->str())) : *text;
}

const std::wstring& ZyrRmCString::emptyText() {
    static const std::wstring empty;
    return empty;
}

std::wstring& ZyrRmCString::writable() {
    // A buffer used by this copy alone can change in place: no other copy can appear meanwhile
    // but by copying this very object.
    if (m_text == nullptr)
        m_text = std::make_shared<std::wstring>();
    else if (m_text.use_count() != 1)
        m_text = std::make_shared<std::wstring>(*m_text);
    return *m_text;
}

void ZyrRmCString::Format(const wchar_t* format, ...) {
    va_list args;
    va_start(args, format);
    *this = hsutVFormat(format, args);
    va_end(args);
}

void ZyrRmCString::FormatMessage(const wchar_t* format, ...) {
    const std::wstring pattern = format != nullptr ? format : L"";
    // Literal runs are inserts with index 0.
    std::vector<Insert> pieces;
    std::map<int, std::wstring> directives;
    size_t literal = 0;
    for (size_t i = 0; i < pattern.size(); ++i) {
        if (pattern[i] != L'%' || i + 1 >= pattern.size())
            continue;
        if (pattern[i + 1] == L'%') {
            pieces.push_back({literal, i + 1, 0});
            literal = ++i + 1;
            continue;
        }
        if (!std::iswdigit(pattern[i + 1]))
            continue;
        size_t j = i + 1;
        int index = 0;
        while (j < pattern.size() && std::iswdigit(pattern[j]) && index < 100)
            index = index * 10 + (pattern[j++] - L'0');
        std::wstring directive = L"s";
        if (j < pattern.size() && pattern[j] == L'!') {
            const size_t close = pattern.find(L'!', j + 1);
            if (close != std::wstring::npos) {
                directive = pattern.substr(j + 1, close - j - 1);
                j = close + 1;
            }
        }
        if (index == 0)
            continue;
        directives.emplace(index, directive);
        pieces.push_back({literal, i, 0});
        pieces.push_back({i, j, index});
        literal = j;
        i = j - 1;
    }
    pieces.push_back({literal, pattern.size(), 0});

    // Arguments come in the order of their numbers; a number that is skipped takes none.
    std::map<int, std::wstring> values;
    va_list args;
    va_start(args, format);
    for (const auto& [index, directive] : directives)
        values[index] = formatPositional(directive, args);
    va_end(args);

    std::wstring text;
    for (const Insert& piece : pieces)
        text += piece.index == 0 ? pattern.substr(piece.begin, piece.end - piece.begin)
                                 : values[piece.index];
    *this = std::move(text);
}

int ZyrRmCString::Compare(const wchar_t* other) const {
    return sign(std::wcscmp(GetString(), other != nullptr ? other : L""));
}

int ZyrRmCString::CompareNoCase(const wchar_t* other) const {
    const wchar_t* a = GetString();
    const wchar_t* b = other != nullptr ? other : L"";
    for (;; ++a, ++b) {
        const wchar_t fa = foldClassic(*a);
        const wchar_t fb = foldClassic(*b);
        if (fa != fb)
            return fa < fb ? -1 : 1;
        if (fa == L'\0')
            return 0;
    }
}

int ZyrRmCString::Find(wchar_t c, int start) const {
    if (start < 0 || static_cast<size_t>(start) > str().size())
        return -1;
    const size_t at = str().find(c, static_cast<size_t>(start));
    return at == std::wstring::npos ? -1 : static_cast<int>(at);
}

int ZyrRmCString::Find(const wchar_t* sub, int start) const {
    if (sub == nullptr || start < 0 || static_cast<size_t>(start) > str().size())
        return -1;
    const size_t at = str().find(sub, static_cast<size_t>(start));
    return at == std::wstring::npos ? -1 : static_cast<int>(at);
}

int ZyrRmCString::Replace(const wchar_t* from, const wchar_t* to) {
    if (from == nullptr || *from == L'\0')
        return 0;
    const std::wstring pattern = from;
    const std::wstring replacement = to != nullptr ? to : L"";
    size_t at = str().find(pattern);
    // Without a match the buffer stays shared.
    if (at == std::wstring::npos)
        return 0;
    std::wstring& text = writable();
    int count = 0;
    for (; at != std::wstring::npos; at = text.find(pattern, at + replacement.size())) {
        text.replace(at, pattern.size(), replacement);
        ++count;
    }
    return count;
}

ZyrRmCString ZyrRmCString::Left(int count) const {
    return str().substr(0, static_cast<size_t>(std::max(count, 0)));
}

ZyrRmCString ZyrRmCString::Mid(int first, int count) const {
    const size_t from = std::min(static_cast<size_t>(std::max(first, 0)), str().size());
    return str().substr(from, count < 0 ? std::wstring::npos : static_cast<size_t>(count));
}

ZyrRmCString ZyrRmCString::Right(int count) const {
    const size_t n = std::min(static_cast<size_t>(std::max(count, 0)), str().size());
    return str().substr(str().size() - n);
}
