// The module's text resource: every number once, a wording for each, and lookups through it.
#include "areacalc/module/ZyrAreaCalculationBaseTexts.h"
#include "platform/base/res/ZyrRmCString.h"

#include <gtest/gtest.h>

#include <cwctype>

namespace {

TEST(ZyrAreaCalculationBaseTexts, everyNumberHasOneTidyWording) {
    const auto& table = ZyrAreaCalculationBaseTexts::table();
    EXPECT_EQ(table.size(), ZyrAreaCalculationBaseTexts::entryCount()) << "a number was written twice";
    for (const auto& [id, wording] : table) {
        ASSERT_FALSE(wording.empty()) << id;
        EXPECT_FALSE(std::iswspace(static_cast<wint_t>(wording.front()))) << id;
        EXPECT_FALSE(std::iswspace(static_cast<wint_t>(wording.back()))) << id;
    }
}

TEST(ZyrAreaCalculationBaseTexts, registeredTextsResolveAndUnregisteredOnesShowTheirNumber) {
    ZyrAreaCalculationBaseTexts::registerTexts();
    const wchar_t* app = ZyrAreaCalculationBaseTexts::kAppName;
    EXPECT_EQ(ZyrRmCString(app, 29007, false), L"Area");
    EXPECT_EQ(ZyrRmCString(app, 29027, false), L"Net area");

    // The migration's new name for a style whose name is taken.
    ZyrRmCString renamed;
    renamed.FormatMessage(ZyrRmCString(app, 29059, false), L"Office", L"Area Style");
    EXPECT_EQ(renamed, L"Office (from Area Style)");

    ZyrAreaCalculationBaseTexts::unregisterTexts();
    EXPECT_NE(ZyrRmCString(app, 29007, false).Find(L"29007"), -1);
}

} // namespace
