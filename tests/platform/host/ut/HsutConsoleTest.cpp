// The text console: exact capture, nested capture, and UTF-8 on standard output.
#include "platform/host/ut/HsutConsole.h"

#include <gtest/gtest.h>

namespace {

TEST(HsutConsole, captureSeesExactlyWhatWasPrinted) {
    HsutConsoleCapture capture;
    EXPECT_EQ(hsutPrintf(L"%s%s (%d kids)\n", L"  ", L"ZyrAbstractTreeNode", 2), 31);
    hsutPrintf(L"%.3f", 1.0);
    EXPECT_EQ(capture.text(), L"  ZyrAbstractTreeNode (2 kids)\n1.000");
}

TEST(HsutConsole, nestedCapturesRestoreTheSinkBeforeThem) {
    HsutConsoleCapture outer;
    hsutPrintf(L"a");
    {
        HsutConsoleCapture inner;
        hsutPrintf(L"b");
        EXPECT_EQ(inner.text(), L"b");
    }
    hsutPrintf(L"c");
    EXPECT_EQ(outer.text(), L"ac");
}

TEST(HsutConsole, theDefaultSinkWritesUtf8ToStandardOutput) {
    testing::internal::CaptureStdout();
    hsutPrintf(L"Fl\u00e4che %d m\u00b2\n", 12);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "Fl\xc3\xa4" "che 12 m\xc2\xb2\n");
}

} // namespace
