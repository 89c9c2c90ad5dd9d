// Wide printf formatting and the console it prints to: the host's string conventions, C's
// numeric rules, no locale, and UTF-8 on standard output.
#include "platform/host/ut/HsutFormat.h"
#include "platform/host/ut/HsutConsole.h"
#include "platform/host/ut/HsutUtf8.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <gtest/gtest.h>

#include <clocale>
#include <sstream>

namespace {

TEST(HsutFormat, integersFollowCWithFlagsWidthAndPrecision) {
    EXPECT_EQ(hsutFormat(L"%d|%i|%u", -42, 7, 4000000000u), L"-42|7|4000000000");
    EXPECT_EQ(hsutFormat(L"[%5d][%-5d][%05d][%+d][% d]", 42, 42, -42, 42, 42),
              L"[   42][42   ][-0042][+42][ 42]");
    EXPECT_EQ(hsutFormat(L"[%.3d][%8.3d][%08.3d][%.0d]", 5, 5, 5, 0),
              L"[005][     005][     005][]");
    EXPECT_EQ(hsutFormat(L"%x %X %#x %o %#o", 255u, 255u, 255u, 8u, 8u), L"ff FF 0xff 10 010");
    EXPECT_EQ(hsutFormat(L"%ld %lld %zu %hd %hhu", -5L, -9000000000LL, size_t{12}, 70000, 300),
              L"-5 -9000000000 12 4464 44");
    EXPECT_EQ(hsutFormat(L"%*d|%-*d|%.*d", 4, 1, 3, 2, 3, 3), L"   1|2  |003");
    EXPECT_EQ(hsutFormat(L"%d", -2147483647 - 1), L"-2147483648");
}

TEST(HsutFormat, floatingPointFollowsCAndIgnoresTheLocale) {
    EXPECT_EQ(hsutFormat(L"%f", 12.5), L"12.500000");
    EXPECT_EQ(hsutFormat(L"%.2f|%8.3f|%-8.1f|%08.2f", 3.14159, 2.5, 2.5, -2.5),
              L"3.14|   2.500|2.5     |-0002.50");
    EXPECT_EQ(hsutFormat(L"%e|%.2E", 1234.5, 0.000123), L"1.234500e+03|1.23E-04");
    EXPECT_EQ(hsutFormat(L"%g|%g|%g|%G", 0.0001, 123456789.0, 100.0, 1e-10),
              L"0.0001|1.23457e+08|100|1E-10");
    EXPECT_EQ(hsutFormat(L"%+.1f|%.0f|%f", 2.25, 2.5, -0.0), L"+2.2|2|-0.000000");
    EXPECT_EQ(hsutFormat(L"%f|%5.1f", 1.0 / 0.0, -1.0 / 0.0), L"inf| -inf");

    // A decimal-comma locale must not leak into formula texts.
    if (std::setlocale(LC_NUMERIC, "de_DE.UTF-8") == nullptr)
        GTEST_SKIP() << "no German locale on this machine";
    EXPECT_EQ(hsutFormat(L"%f", 12.5), L"12.500000");
    std::setlocale(LC_NUMERIC, "C");
}

TEST(HsutFormat, stringsAreWideByDefaultAndNarrowOnRequest) {
    EXPECT_EQ(hsutFormat(L"%s/%ls", L"wide", L"also wide"), L"wide/also wide");
    EXPECT_EQ(hsutFormat(L"%S/%hs", "narrow", "gr\xc3\xbc\xc3\x9f"), L"narrow/gr\u00fc\u00df");
    EXPECT_EQ(hsutFormat(L"[%6s][%-6s][%.2s]", L"ab", L"ab", L"abcdef"), L"[    ab][ab    ][ab]");
    EXPECT_EQ(hsutFormat(L"%c%C%hc", L'\u00e4', 'b', 'c'), L"\u00e4bc");
    EXPECT_EQ(hsutFormat(L"%s|%S", static_cast<const wchar_t*>(nullptr),
                         static_cast<const char*>(nullptr)),
              L"(null)|(null)");
}

TEST(HsutFormat, oddDirectivesAreShownNotCrashedOn) {
    EXPECT_EQ(hsutFormat(L"100%%"), L"100%");
    EXPECT_EQ(hsutFormat(L"%y and %"), L"%y and %");
    int written = 0;
    EXPECT_EQ(hsutFormat(L"a%nb", &written), L"ab");
    EXPECT_EQ(written, 0) << "%n never stores";
    EXPECT_EQ(hsutFormat(nullptr), L"");
}

TEST(HsutConsole, captureSeesExactlyWhatWasPrintedAndNestedOnesRestoreTheSinkBefore) {
    HsutConsoleCapture outer;
    EXPECT_EQ(hsutPrintf(L"%s%s (%d kids)\n", L"  ", L"ZyrAbstractTreeNode", 2), 31);
    {
        HsutConsoleCapture inner;
        hsutPrintf(L"%.3f", 1.0);
        EXPECT_EQ(inner.text(), L"1.000");
    }
    hsutPrintf(L"c");
    EXPECT_EQ(outer.text(), L"  ZyrAbstractTreeNode (2 kids)\nc");
}

TEST(HsutConsole, theDefaultSinkWritesUtf8ToStandardOutput) {
    testing::internal::CaptureStdout();
    hsutPrintf(L"Fl\u00e4che %d m\u00b2\n", 12);
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "Fl\xc3\xa4"
                                                      "che 12 m\xc2\xb2\n");
}

TEST(HsutUtf8, roundTripsEveryPlaneAndReplacesWhatCannotBeCarried) {
    const std::wstring text = L"A\u00e4\u20ac\U0001F600";
    EXPECT_EQ(hsutToUtf8(text), "A\xc3\xa4\xe2\x82\xac\xf0\x9f\x98\x80");
    EXPECT_EQ(hsutFromUtf8(hsutToUtf8(text)), text);
    EXPECT_EQ(hsutToUtf8(std::wstring(1, static_cast<wchar_t>(0xD800))), "\xef\xbf\xbd");
    // Truncated, overlong and stray continuation bytes each become one replacement character.
    EXPECT_EQ(hsutFromUtf8("a\xe2\x82"), L"a\ufffd\ufffd");
    EXPECT_EQ(hsutFromUtf8("\xc0\xaf"), L"\ufffd\ufffd");
    EXPECT_EQ(hsutFromUtf8("\x80z"), L"\ufffdz");
    EXPECT_EQ(hsutFromUtf8("\xed\xa0\x80"), L"\ufffd\ufffd\ufffd") << "an encoded surrogate";
}

TEST(HsysErrorStatus, printsNameAndNumber) {
    std::ostringstream out;
    out << Hsys::eWrongClass << ", " << Hsys::eNewerVersion << ", "
        << static_cast<Hsys::ErrorStatus>(4);
    EXPECT_EQ(out.str(), "eWrongClass (46), eNewerVersion (301), unknown status (4)");
}

} // namespace
