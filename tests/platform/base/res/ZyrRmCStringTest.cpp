// The system string: formatting, case-insensitive comparison, searching, and resource texts.
#include "platform/base/res/ZyrResourceText.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/base/res/ZyrTextResources.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrRmCString, formatTakesWideAndNarrowArguments) {
    ZyrRmCString text;
    text.Format(L"%s has %d rooms, %S, %.2f m\u00b2", L"Floor 1", 3, "k\xc3\xbc" "che", 12.345);
    EXPECT_EQ(text, L"Floor 1 has 3 rooms, k\u00fcche, 12.35 m\u00b2");
    EXPECT_EQ(text.GetLength(), 36) << "one character per code point";
    text.Format(L"%hs|%ls", "a", L"b");
    EXPECT_EQ(text, L"a|b");
}

TEST(ZyrRmCString, formatMessageInsertsByPositionAndType) {
    ZyrRmCString text;
    text.FormatMessage(L"%2 before %1, 100%% of %3!d! at %4!.1f!", L"first", L"second", 7, 2.25);
    EXPECT_EQ(text, L"second before first, 100% of 7 at 2.2");
    text.FormatMessage(L"%1%1 and %%1", L"x");
    EXPECT_EQ(text, L"xx and %1") << "a repeated number takes one argument; %% is a literal percent";
    text.FormatMessage(L"no inserts, a lone % stays");
    EXPECT_EQ(text, L"no inserts, a lone % stays");
}

TEST(ZyrRmCString, compareNoCaseFoldsOnlyWhatTheClassicLocaleFolds) {
    struct Case {
        const wchar_t* a;
        const wchar_t* b;
        int expected;
    };
    const Case cases[] = {
        {L"Area", L"aREA", 0},
        {L"AREA-1", L"area-1", 0},
        {L"\u00c4rea", L"\u00e4rea", -1}, // A with diaeresis: no folding outside ASCII
        {L"\u0391", L"\u03b1", -1},       // Greek capital alpha stays itself
        {L"abc", L"ABD", -1},
        {L"b", L"A", 1},
        {L"Z", L"a", 1}, // folded: "z" > "a", where the exact compare says "Z" < "a"
        {L"ab", L"AB\u00e4", -1},
        {L"", L"", 0},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(ZyrRmCString(c.a).CompareNoCase(c.b), c.expected) << "'" << ZyrRmCString(c.a).str().size();
        EXPECT_EQ(ZyrRmCString(c.b).CompareNoCase(c.a), -c.expected);
    }
    EXPECT_EQ(ZyrRmCString(L"Z").Compare(L"a"), -1);
    EXPECT_EQ(ZyrRmCString(L"x").CompareNoCase(nullptr), 1);
}

TEST(ZyrRmCString, findReplaceAndSlices) {
    const ZyrRmCString text(L"_AREA_VALUE_ * 0.5 + _AREA_VALUE_");
    EXPECT_EQ(text.Find(L"_AREA_VALUE_"), 0);
    EXPECT_EQ(text.Find(L"_AREA_VALUE_", 1), 21);
    EXPECT_EQ(text.Find(L'*'), 13);
    EXPECT_EQ(text.Find(L"missing"), -1);
    EXPECT_EQ(text.Find(L'A', 100), -1);
    EXPECT_EQ(text.Find(L'A', -1), -1);

    ZyrRmCString formula = text;
    EXPECT_EQ(formula.Replace(L"_AREA_VALUE_", L"12.000000"), 2);
    EXPECT_EQ(formula, L"12.000000 * 0.5 + 12.000000");
    EXPECT_EQ(formula.Replace(L"", L"x"), 0);
    ZyrRmCString grow(L"aa");
    EXPECT_EQ(grow.Replace(L"a", L"aa"), 2) << "replacements are not searched again";
    EXPECT_EQ(grow, L"aaaa");

    EXPECT_EQ(text.Left(5), L"_AREA");
    EXPECT_EQ(text.Mid(13, 1), L"*");
    EXPECT_EQ(text.Right(6), L"VALUE_");
    EXPECT_EQ(text.Mid(100), L"");
    EXPECT_EQ(text.Right(1000), text);
}

TEST(ZyrRmCString, resourceTextsComeFromTheModulesTable) {
    ZyrTextResources::registerTable(L"TestApp80", {{100, L"Net &area"}, {101, L"Fish && chips"}});
    EXPECT_EQ(ZyrRmCString(L"TestApp80", 100, false), L"Net &area");
    EXPECT_EQ(ZyrRmCString(L"TestApp80", 100, true), L"Net area");
    EXPECT_EQ(ZyrRmCString(L"TestApp80", 101, true), L"Fish & chips");

    const ZyrRmCString missing(L"TestApp80", 99999, false);
    EXPECT_NE(missing.Find(L"99999"), -1) << missing.str().size();
    EXPECT_NE(ZyrRmCString(L"NoSuchApp", 100, false).Find(L"NoSuchApp"), -1);
    EXPECT_NE(ZyrRmCString(nullptr, 1, false).Find(L"1"), -1);

    // Lookups share the table's text, and a copy outlives the table it came from.
    const ZyrRmCString net(L"TestApp80", 100, false);
    EXPECT_EQ(net.GetString(), ZyrRmCString(L"TestApp80", 100, false).GetString());
    ZyrTextResources::unregisterTable(L"TestApp80");
    EXPECT_FALSE(ZyrTextResources::hasTable(L"TestApp80"));
    EXPECT_NE(ZyrRmCString(L"TestApp80", 100, false), L"Net &area");
    EXPECT_EQ(net, L"Net &area");
}

// A kept text follows its table: registered anew, removed, or never there.
TEST(ZyrRmCString, aKeptResourceTextFollowsItsTable) {
    const ZyrResourceText kept(L"TestApp81", 7);
    EXPECT_NE(kept.text().Find(L"missing"), -1);
    ZyrTextResources::registerTable(L"TestApp81", {{7, L"Gross area"}});
    EXPECT_EQ(kept.text(), L"Gross area");
    EXPECT_EQ(kept.text().GetString(), ZyrRmCString(L"TestApp81", 7, false).GetString());
    ZyrTextResources::registerTable(L"TestApp81", {{7, L"Bruttofl\u00e4che"}});
    EXPECT_EQ(kept.text(), L"Bruttofl\u00e4che");
    ZyrTextResources::unregisterTable(L"TestApp81");
    EXPECT_EQ(kept.text(), ZyrRmCString(L"TestApp81", 7, false));
}

// Copies share one buffer; every way of changing a copy leaves the others as they were.
TEST(ZyrRmCString, changingACopyLeavesTheOthers) {
    using Change = void (*)(ZyrRmCString&);
    const Change changes[] = {
        [](ZyrRmCString& s) { s += L"!"; },
        [](ZyrRmCString& s) { s += ZyrRmCString(L"!"); },
        [](ZyrRmCString& s) { s += L'!'; },
        [](ZyrRmCString& s) { s.Replace(L"room", L"hall"); },
        [](ZyrRmCString& s) { s.Format(L"%d", 7); },
        [](ZyrRmCString& s) { s.FormatMessage(L"%1", L"x"); },
        [](ZyrRmCString& s) { s.Empty(); },
        [](ZyrRmCString& s) { s = L"other"; },
    };
    for (size_t i = 0; i < std::size(changes); ++i) {
        const ZyrRmCString original(L"Living room");
        ZyrRmCString copy = original;
        EXPECT_EQ(copy.GetString(), original.GetString()) << "a copy shares the text";
        changes[i](copy);
        EXPECT_EQ(original, L"Living room") << "change " << i;
        EXPECT_NE(copy, original) << "change " << i;
    }
    ZyrRmCString unchanged(L"Living room");
    const ZyrRmCString copy = unchanged;
    EXPECT_EQ(unchanged.Replace(L"kitchen", L"hall"), 0);
    EXPECT_EQ(unchanged.GetString(), copy.GetString()) << "a replacement without a match copies nothing";
    EXPECT_EQ(ZyrRmCString().GetString()[0], L'\0');
}

} // namespace
