// The system string: wide characters, one code point each.
#pragma once

#include <memory>
#include <string>
#include <vector>

class ZyrRmCString {
public:
    ZyrRmCString() = default;
    ZyrRmCString(const wchar_t* text);
    ZyrRmCString(std::wstring text);
    // The text of a module's resource. With stripMnemonics the '&' that marks a menu mnemonic is
    // dropped ("&&" stays as one '&'), for texts shown as plain labels such as column names. An
    // unknown module or number gives a visible placeholder.
    ZyrRmCString(const wchar_t* appName, unsigned int id, bool stripMnemonics);

    int GetLength() const { return static_cast<int>(str().size()); }
    bool IsEmpty() const { return str().empty(); }
    void Empty() { m_text.reset(); }
    const wchar_t* GetString() const { return str().c_str(); }
    operator const wchar_t*() const { return str().c_str(); }
    const std::wstring& str() const { return m_text != nullptr ? *m_text : emptyText(); }
    wchar_t GetAt(int index) const { return str().at(static_cast<size_t>(index)); }

    // printf-style, with the host's wide conventions ("%s" wide, "%S" and "%hs" UTF-8).
    void Format(const wchar_t* format, ...);
    // Inserts arguments by position: "%1", "%2!d!", ... Without "!format!" an argument is a wide
    // string. "%%" is a percent sign. Arguments are passed in the order of their numbers.
    void FormatMessage(const wchar_t* format, ...);

    // Exact comparison by character value.
    int Compare(const wchar_t* other) const;
    // Comparison after folding case with the classic locale: only A-Z fold, so "Ä" and "ä" differ.
    int CompareNoCase(const wchar_t* other) const;

    // Position of the first occurrence at or after start, or -1.
    int Find(wchar_t c, int start = 0) const;
    int Find(const wchar_t* sub, int start = 0) const;
    // Replaces every occurrence; returns how many were replaced. An empty pattern replaces nothing.
    int Replace(const wchar_t* from, const wchar_t* to);

    ZyrRmCString Left(int count) const;
    ZyrRmCString Mid(int first, int count = -1) const;
    ZyrRmCString Right(int count) const;

    ZyrRmCString& operator+=(const ZyrRmCString& other) {
        writable() += other.str();
        return *this;
    }
    ZyrRmCString& operator+=(const wchar_t* other) {
        writable() += other != nullptr ? other : L"";
        return *this;
    }
    ZyrRmCString& operator+=(wchar_t c) {
        writable() += c;
        return *this;
    }
    friend ZyrRmCString operator+(ZyrRmCString left, const ZyrRmCString& right) {
        return left += right;
    }
    // Copies of one text share its buffer and are equal without a look at the characters.
    friend bool operator==(const ZyrRmCString& a, const ZyrRmCString& b) {
        return a.m_text == b.m_text || a.str() == b.str();
    }
    friend bool operator==(const ZyrRmCString& a, const wchar_t* b) { return a.Compare(b) == 0; }
    friend auto operator<=>(const ZyrRmCString& a, const ZyrRmCString& b) {
        return a.str() <=> b.str();
    }

private:
    static const std::wstring& emptyText();
    // The text alone, no longer shared with any copy.
    std::wstring& writable();

    // Copies share one buffer until one of them changes: texts are copied far more often than
    // changed (every calculation record carries its names), and a copy must cost no allocation.
    // Null is the empty text.
    std::shared_ptr<std::wstring> m_text;
};

using ZyrRmCStringArray = std::vector<ZyrRmCString>;
