#include "platform/base/app/ZyrUserMessages.h"

#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/ut/HsutConsole.h"
#include "platform/host/ut/HsutFormat.h"

namespace {

void printOnConsole(ZyrUserMessageKind kind, std::wstring_view text) {
    const wchar_t* prefix = kind == ZyrUserMessageKind::kAlert ? L"Alert" : L"Message";
    hsutPrintf(L"%s: %s\n", prefix, std::wstring(text).c_str());
}

ZyrUserMessages::Sink& currentSink() {
    static ZyrUserMessages::Sink sink = printOnConsole;
    return sink;
}

std::wstring failureText(Hsys::ErrorStatus status) {
    return hsutFormat(L"The operation failed: %S (%d).", Hsys::toString(status),
                      static_cast<int>(status));
}

} // namespace

ZyrUserMessages::Sink ZyrUserMessages::setSink(Sink sink) {
    Sink previous = std::move(currentSink());
    currentSink() = sink ? std::move(sink) : Sink(printOnConsole);
    return previous;
}

void ZyrUserMessages::post(ZyrUserMessageKind kind, std::wstring_view text) {
    currentSink()(kind, text);
}

ZyrUserMessageCapture::ZyrUserMessageCapture()
    : m_previous(ZyrUserMessages::setSink([this](ZyrUserMessageKind kind, std::wstring_view text) {
          m_entries.emplace_back(kind, std::wstring(text));
      })) {}

ZyrUserMessageCapture::~ZyrUserMessageCapture() {
    ZyrUserMessages::setSink(std::move(m_previous));
}

namespace Zyr {

void rxErrorAlert(Hsys::ErrorStatus status) {
    ZyrUserMessages::post(ZyrUserMessageKind::kAlert, failureText(status));
}

void alertOpenFailure(Hsys::ErrorStatus status, const HsRxClass* cls) {
    ZyrRmCString className;
    classTypeToDisplayName(cls, className);
    if (className.IsEmpty())
        className = L"object";
    ZyrUserMessages::post(ZyrUserMessageKind::kAlert,
                          hsutFormat(L"Could not open the %s: %S (%d).", className.GetString(),
                                     Hsys::toString(status), static_cast<int>(status)));
}

void rxErrorMsg(Hsys::ErrorStatus status) {
    ZyrUserMessages::post(ZyrUserMessageKind::kMessage, failureText(status));
}

} // namespace Zyr
