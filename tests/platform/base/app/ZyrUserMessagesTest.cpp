// Failures told to the user: the exact wording, the kind, the default console and captures.
#include "platform/base/app/ZyrUserMessages.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/ut/HsutConsole.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrUserMessages, reportsGoToTheInnermostCaptureElseToTheConsole) {
    HsutConsoleCapture console;
    Zyr::rxErrorMsg(Hsys::eNullId);
    {
        ZyrUserMessageCapture outer;
        {
            ZyrUserMessageCapture inner;
            Zyr::rxErrorAlert(Hsys::eBadArgument);
            EXPECT_EQ(inner.entries().size(), 1u);
        }
        Zyr::rxErrorAlert(Hsys::eInvalidDictionary);
        Zyr::alertOpenFailure(Hsys::eWasOpenForWrite, HsRxDictionary::desc());
        Zyr::alertOpenFailure(Hsys::eWrongClass, nullptr);
        Zyr::rxErrorMsg(Hsys::eOutOfMemory);
        using Kind = ZyrUserMessageKind;
        const std::vector<ZyrUserMessageCapture::Entry> expected = {
            {Kind::kAlert, L"The operation failed: eInvalidDictionary (32)."},
            {Kind::kAlert, L"Could not open the HsRxDictionary: eWasOpenForWrite (1002)."},
            {Kind::kAlert, L"Could not open the object: eWrongClass (46)."},
            {Kind::kMessage, L"The operation failed: eOutOfMemory (6)."},
        };
        EXPECT_EQ(outer.entries(), expected);
    }
    Zyr::rxErrorAlert(Hsys::eDoesNotApply);
    EXPECT_EQ(console.text(), L"Message: The operation failed: eNullId (16).\n"
                              L"Alert: The operation failed: eDoesNotApply (2).\n");
}

} // namespace
