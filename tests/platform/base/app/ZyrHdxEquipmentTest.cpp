// Text helpers shared by the sibling modules.
#include "platform/base/app/ZyrHdxEquipment.h"

#include "platform/base/res/ZyrRmCString.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrHdxEquipment, multipleSubstReplacesEveryOccurrenceOnce) {
    const struct {
        const wchar_t* text;
        const wchar_t* from;
        const wchar_t* to;
        const wchar_t* expected;
    } cases[] = {
        {L"_AREA_VALUE_*0.9+_AREA_VALUE_", L"_AREA_VALUE_", L"\u00b0\u00b0\u00b0\u00b0\u00b0\u00b0",
         L"\u00b0\u00b0\u00b0\u00b0\u00b0\u00b0*0.9+\u00b0\u00b0\u00b0\u00b0\u00b0\u00b0"},
        {L"5-_AREA_VALUE_", L"_AREA_VALUE_", L"-3.000000", L"5--3.000000"},
        {L"aa", L"a", L"aa", L"aaaa"}, // inserted text is not searched again
        {L"aaa", L"aa", L"b", L"ba"},  // from the left, without overlaps
        {L"abc", L"", L"x", L"abc"},
        {L"abc", L"z", L"x", L"abc"},
        {L"x+x", L"x", L"", L"+"},
        {L"", L"x", L"y", L""},
    };
    for (const auto& c : cases) {
        ZyrRmCString text(c.text);
        ZyrHdxEquipment::multipleSubst(text, c.from, c.to);
        EXPECT_EQ(text, c.expected) << c.text << " / " << c.from;
    }
}

} // namespace
