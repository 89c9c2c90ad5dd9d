#include "platform/host/ut/HsutConsole.h"

#include "platform/host/ut/HsutFormat.h"
#include "platform/host/ut/HsutUtf8.h"

#include <cstdarg>
#include <cstdio>
#include <string>

namespace {

void writeUtf8ToStdout(std::wstring_view text) {
    const std::string bytes = hsutToUtf8(text);
    std::fwrite(bytes.data(), 1, bytes.size(), stdout);
    std::fflush(stdout);
}

HsutConsole::Sink& currentSink() {
    static HsutConsole::Sink sink = writeUtf8ToStdout;
    return sink;
}

} // namespace

HsutConsole::Sink HsutConsole::setSink(Sink sink) {
    Sink previous = std::move(currentSink());
    currentSink() = sink ? std::move(sink) : Sink(writeUtf8ToStdout);
    return previous;
}

void HsutConsole::write(std::wstring_view text) { currentSink()(text); }

int hsutPrintf(const wchar_t* format, ...) {
    va_list args;
    va_start(args, format);
    const std::wstring text = hsutVFormat(format, args);
    va_end(args);
    HsutConsole::write(text);
    return static_cast<int>(text.size());
}

HsutConsoleCapture::HsutConsoleCapture()
    : m_previous(HsutConsole::setSink([this](std::wstring_view text) { m_text += text; })) {}

HsutConsoleCapture::~HsutConsoleCapture() { HsutConsole::setSink(std::move(m_previous)); }
