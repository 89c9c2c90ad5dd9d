// How the sibling modules tell the user of a failure: alerts and messages go to one replaceable
// sink, the host's text console unless a host or a test installs another.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <functional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

class HsRxClass;

// An alert interrupts the user (a message box in an editor); a message is a line the user may read
// later. A batch host shows both the same way.
enum class ZyrUserMessageKind { kAlert, kMessage };

class ZyrUserMessages {
public:
    using Sink = std::function<void(ZyrUserMessageKind, std::wstring_view)>;

    // Installs a sink and returns the one it replaces; an empty sink restores the default, which
    // prints "Alert: ..." or "Message: ..." lines on the host's console.
    static Sink setSink(Sink sink);
    static void post(ZyrUserMessageKind kind, std::wstring_view text);
};

// Collects everything posted while it lives, and restores the sink it replaced afterwards.
class ZyrUserMessageCapture {
public:
    using Entry = std::pair<ZyrUserMessageKind, std::wstring>;

    ZyrUserMessageCapture();
    ~ZyrUserMessageCapture();
    ZyrUserMessageCapture(const ZyrUserMessageCapture&) = delete;
    ZyrUserMessageCapture& operator=(const ZyrUserMessageCapture&) = delete;

    const std::vector<Entry>& entries() const { return m_entries; }
    void clear() { m_entries.clear(); }

private:
    std::vector<Entry> m_entries;
    ZyrUserMessages::Sink m_previous;
};

namespace Zyr {

// "The operation failed: eWrongClass (46)."
void rxErrorAlert(Hsys::ErrorStatus status);
// "Could not open the <class>: eWasOpenForWrite (1002)." The class is named by its display name;
// a null class reads as "object".
void alertOpenFailure(Hsys::ErrorStatus status, const HsRxClass* cls);
// The same wording as rxErrorAlert, as a message rather than an alert.
void rxErrorMsg(Hsys::ErrorStatus status);

} // namespace Zyr
