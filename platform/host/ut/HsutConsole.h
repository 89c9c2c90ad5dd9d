// The host's text console: everything hsutPrintf prints goes to one replaceable sink.
#pragma once

#include <functional>
#include <string>
#include <string_view>

// Formats as hsutFormat does and hands the text to the console's sink. Returns the number of
// characters printed.
int hsutPrintf(const wchar_t* format, ...);

class HsutConsole {
public:
    using Sink = std::function<void(std::wstring_view)>;

    // Installs a sink and returns the one it replaces; an empty sink restores the default, which
    // writes UTF-8 to standard output.
    static Sink setSink(Sink sink);
    static void write(std::wstring_view text);
};

// Captures the console for the life of the object and restores the previous sink afterwards.
class HsutConsoleCapture {
public:
    HsutConsoleCapture();
    ~HsutConsoleCapture();
    HsutConsoleCapture(const HsutConsoleCapture&) = delete;
    HsutConsoleCapture& operator=(const HsutConsoleCapture&) = delete;

    const std::wstring& text() const { return m_text; }
    void clear() { m_text.clear(); }

private:
    std::wstring m_text;
    HsutConsole::Sink m_previous;
};
