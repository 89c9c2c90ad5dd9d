// Formula evaluation, parameter binding, expansion of names and the number format of formulas.
#include "platform/base/expr/ZyrExpressionHandler.h"

#include <gtest/gtest.h>

#include <bit>
#include <cfloat>
#include <clocale>
#include <cmath>
#include <cstdint>
#include <numbers>
#include <string>

namespace {

using Parameters = ZyrExpressionHandler::ParameterPairVector;

struct Outcome {
    Hsys::ErrorStatus status;
    double value;
    std::wstring message;
};

// The result starts at a sentinel, so that a failure which writes it shows.
Outcome evaluate(const std::wstring& text, const Parameters& parameters = {}) {
    const ZyrExpressionHandler handler;
    double value = -777.0;
    const Hsys::ErrorStatus status = handler.evaluate(text, parameters, value);
    return {status, value, handler.lastError().str()};
}

// Messages and formulas of these tests are ASCII where they are printed.
std::string narrow(const std::wstring& text) {
    return std::string(text.begin(), text.end());
}

std::wstring expand(const std::wstring& text, const Parameters& parameters) {
    ZyrRmCString result;
    ZyrExpressionHandler().expand(text, parameters, result, nullptr, nullptr);
    return result.str();
}

std::wstring defaultFormat(double value) {
    ZyrRmCString text;
    ZyrExpressionHandler::defaultFormatCB(value, text, nullptr);
    return text.str();
}

TEST(ZyrExpressionHandler, evaluatesByPrecedenceAndBindsParametersByTheirWholeName) {
    const Parameters named = {{L"a", 2},  {L"area", 10},        {L"room height", 2.5}, {L"x1", 3},
                              {L"a", 99}, {L"_AREA_VALUE_", 6}, {L"Fl\u00e4che", 4},   {L"pi", 3}};
    const double pi = std::numbers::pi;
    // clang-format off
    const struct {
        const wchar_t* text;
        double expected;
        bool withNames;
    } cases[] = {
        {L"1+2*3", 7, false}, {L"(1+2)*3", 9, false}, {L"10-4-3", 3, false}, {L"8/4/2", 1, false},
        {L"2*3/4", 1.5, false}, {L"2^3^2", 512, false}, {L"-2^2", 4, false}, {L"-(2^2)", -4, false},
        {L"2^-2", 0.25, false}, {L"2^-1^2", 2, false}, {L"5---3", 2, false}, {L"2*-3", -6, false},
        {L"5.000000--3.000000", 8, false}, {L"--3", 3, false}, {L"12.*2", 24, false},
        {L" 1e3 + .5 ", 1000.5, false}, {L"1E-2*100", 1, false}, {L"12.500000 * 2", 25, false},
        {L"sqrt(16)", 4, false}, {L"sqrt (9)", 3, false}, {L"abs(-2.5)", 2.5, false},
        {L"min(3, 1, 2)", 1, false}, {L"max(3,1,2)", 3, false}, {L"cos(0)+tan(0)", 1, false},
        {L"sin(pi/2)", 1, false}, {L"atan(1)*4", pi, false}, {L"\t-pi\r\n", -pi, false},
        {L"a*area", 20, true}, {L"room height*2", 5, true}, {L"Fl\u00e4che+x1", 7, true},
        {L"_AREA_VALUE_/a", 3, true}, {L"pi", 3, true}, {L"max(a, x1)", 3, true}};
    // clang-format on
    for (const auto& c : cases) {
        const Outcome outcome = evaluate(c.text, c.withNames ? named : Parameters{});
        EXPECT_EQ(outcome.status, Hsys::eSuccess) << narrow(outcome.message);
        EXPECT_EQ(outcome.value, c.expected) << c.text;
    }
    EXPECT_EQ(evaluate(L"room  height", named).status, Hsys::eNameNotFound) << "spaces count";
    EXPECT_EQ(evaluate(L"A", named).status, Hsys::eNameNotFound) << "case counts";
}

TEST(ZyrExpressionHandler, refusesFaultyFormulasWithStatusAndPosition) {
    const Parameters parameters = {{L"a", 2}, {L"nan", std::nan("")}};
    const struct {
        const wchar_t* text;
        Hsys::ErrorStatus status;
        const wchar_t* message;
    } cases[] = {
        {L"", Hsys::eInvalidInput, L"the formula is empty at position 1"},
        {L"1+", Hsys::eInvalidInput, L"found the end of the formula at position 3"},
        {L"(1+2", Hsys::eInvalidInput,
         L"expected an operator or ')', found the end of the formula at position 5"},
        {L"123,456*0.5", Hsys::eInvalidInput, L"found ',' at position 4"},
        {L"3 # 4", Hsys::eInvalidInput, L"character '#' at position 3"},
        {L"a\u00a0", Hsys::eInvalidInput, L"character U+00A0 at position 2"},
        {L"1+2a", Hsys::eInvalidInput, L"malformed number '2a' at position 3"},
        {L"a+b", Hsys::eNameNotFound, L"unknown parameter 'b' at position 3"},
        {L"2*nan", Hsys::eInvalidInput, L"parameter 'nan' has no finite value at position 3"},
        {L"1-foo(1)", Hsys::eNameNotFound, L"unknown function 'foo' at position 3"},
        {L"2*sqrt(1,2)", Hsys::eBadArgument,
         L"function 'sqrt' takes 1 argument, not 2 at position 3"},
        {L"min(1)", Hsys::eBadArgument,
         L"function 'min' takes 2 or more arguments, not 1 at position 1"},
        {L"max()", Hsys::eBadArgument, L"not 0 at position 1"},
        {L"min(1 2)", Hsys::eInvalidInput, L"expected ',' or ')', found '2' at position 7"},
        {L"1/0", Hsys::eInvalidInput, L"division by zero at position 2"},
        {L"1+1/(a-2)", Hsys::eInvalidInput, L"division by zero at position 4"},
        {L"sqrt(-1)", Hsys::eInvalidInput,
         L"the result of 'sqrt' is not a finite number at position 1"},
        {L"1e308*10", Hsys::eInvalidInput,
         L"the result of '*' is not a finite number at position 6"},
        {L"0^-1", Hsys::eInvalidInput, L"'^' is not a finite number at position 2"},
        {L"1+1e999", Hsys::eInvalidInput, L"number '1e999' is out of range at position 3"}};
    for (const auto& c : cases) {
        const Outcome outcome = evaluate(c.text, parameters);
        EXPECT_EQ(outcome.status, c.status) << c.text;
        EXPECT_EQ(outcome.value, -777.0) << c.text << ": the result must stay as it was";
        EXPECT_NE(outcome.message.find(c.message), std::wstring::npos)
            << narrow(c.text) << " gave: " << narrow(outcome.message);
    }
}

TEST(ZyrExpressionHandler, refusesDeepNestingButNotLongRuns) {
    const auto nested = [](size_t depth, const wchar_t* open, const wchar_t* close = L"") {
        std::wstring text;
        for (size_t i = 0; i < depth; ++i)
            text += open;
        text += L"1";
        for (size_t i = 0; i < depth; ++i)
            text += close;
        return text;
    };
    EXPECT_EQ(evaluate(nested(99, L"(", L")")).value, 1) << "the whole formula is one level";
    EXPECT_EQ(evaluate(nested(100, L"(", L")")).status, Hsys::eInvalidInput);
    const Outcome deep = evaluate(nested(100000, L"abs(", L")"));
    EXPECT_EQ(deep.status, Hsys::eInvalidInput);
    EXPECT_NE(deep.message.find(L"nests deeper than 100 levels at position 401"),
              std::wstring::npos);
    EXPECT_EQ(evaluate(nested(100000, L"1^")).status, Hsys::eInvalidInput);
    EXPECT_EQ(evaluate(nested(100000, L"(")).status, Hsys::eInvalidInput);
    EXPECT_EQ(evaluate(nested(100000, L"-")).value, 1) << "minus signs are not nesting";
    EXPECT_EQ(evaluate(nested(100000, L"1+")).value, 100001);
}

TEST(ZyrExpressionHandler, expandReplacesWholeNamesAndKeepsTheValue) {
    const Parameters parameters = {{L"a", 2},  {L"b", -3},  {L"room height", 2.5},
                                   {L"e5", 7}, {L"max", 1}, {L"c", 0.1 + 0.2}};
    EXPECT_EQ(expand(L"area*a + a2 - b^2 + room height*c + max(a, 1e5) - -b + pi", parameters),
              L"area*2 + a2 - -3^2 + 2.5*0.30000000000000004 + max(2, 1e5) - --3 + pi");
    EXPECT_EQ(expand(L"\u00b0\u00b0\u00b0\u00b0\u00b0\u00b0*a", parameters),
              L"\u00b0\u00b0\u00b0\u00b0\u00b0\u00b0*2");
    EXPECT_EQ(expand(L"(a,,a #", parameters), L"(2,,2 #") << "text that does not parse expands";

    const std::wstring valid = L"a*(b^2 - room height^b) / -c + 2^b - a^-b";
    const Outcome direct = evaluate(valid, parameters);
    ASSERT_EQ(direct.status, Hsys::eSuccess) << narrow(direct.message);
    EXPECT_EQ(evaluate(expand(valid, parameters)).value, direct.value)
        << "the default format reads back exactly, and a negative value keeps its meaning";

    ZyrExpressionHandler handler;
    handler.setExpression(L"w*h");
    handler.addParameter(L"w", 1.25);
    handler.addParameter(L"h", 2);
    int calls = 0;
    const auto fixedTwo = [](double value, ZyrRmCString& text, void* data) {
        ++*static_cast<int*>(data);
        text.Format(L"%.2f", value);
    };
    ZyrRmCString result(L"previous content");
    handler.expand(result, fixedTwo, &calls);
    EXPECT_EQ(result, L"1.25*2.00");
    EXPECT_EQ(calls, 2);
    EXPECT_EQ(handler.expression(), L"w*h") << "the stored text is never changed";
}

TEST(ZyrExpressionHandler, defaultFormatIsShortestAndReadsBackExactly) {
    // clang-format off
    const struct {
        double value;
        const wchar_t* text;
    } formats[] = {
        {12.5, L"12.5"},     {-3, L"-3"},      {0.1 + 0.2, L"0.30000000000000004"}, {1e-5, L"0.00001"},
        {100000, L"100000"}, {1e-7, L"1e-07"}, {1e15, L"1000000000000000"},     {1e16, L"1e+16"},
        {-0.0, L"-0"},       {0, L"0"}};
    const double awkward[] = {1e-7, 1e15, -0.0, 0.1 + 0.2, 1.0 / 3, -2.0 / 3 * 1e-12,
                              9.999999999999999e15, 5e-324, DBL_MAX, -DBL_MIN, 123456789.123456789};
    // clang-format on
    for (const auto& f : formats)
        EXPECT_EQ(defaultFormat(f.value), f.text);
    for (const double value : awkward) {
        const Outcome outcome = evaluate(defaultFormat(value));
        ASSERT_EQ(outcome.status, Hsys::eSuccess) << narrow(outcome.message);
        EXPECT_EQ(std::bit_cast<std::uint64_t>(outcome.value), std::bit_cast<std::uint64_t>(value))
            << "sign and every bit come back for " << value;
        ZyrRmCString printf;
        printf.Format(L"%f", value);
        EXPECT_EQ(evaluate(printf.str()).status, Hsys::eSuccess) << narrow(printf.str());
    }
}

TEST(ZyrExpressionHandler, numbersIgnoreTheProcessLocale) {
    // The C locale is what turns "%f" and strtod to a decimal comma.
    struct LocaleScope {
        std::string previous = std::setlocale(LC_ALL, nullptr);
        ~LocaleScope() { std::setlocale(LC_ALL, previous.c_str()); }
    } scope;
    if (std::setlocale(LC_ALL, "de_DE.UTF-8") == nullptr)
        GTEST_SKIP() << "no de_DE.UTF-8 locale on this machine";
    ZyrRmCString printf;
    printf.Format(L"%f", 12.5);
    EXPECT_EQ(evaluate(printf.str() + L"*2").value, 25);
    EXPECT_EQ(defaultFormat(1234.5), L"1234.5");
    EXPECT_EQ(evaluate(L"1,5").status, Hsys::eInvalidInput) << "a decimal comma is no number";
}

TEST(ZyrExpressionHandler, parametersKeepOrderAndTakeValuesThroughAConstHandler) {
    ZyrExpressionHandler handler;
    handler.setExpression(L"b - a");
    handler.addParameter(L"a", 1);
    handler.addParameter(L"b", 2);
    handler.addParameter(L"a", 3);
    const ZyrExpressionHandler& pattern = handler;
    EXPECT_EQ(pattern.setParameterValue(1, 10), Hsys::eSuccess);
    EXPECT_EQ(pattern.setParameterValue(3, 5), Hsys::eInvalidIndex);
    EXPECT_EQ(pattern.setParameterValue(-1, 5), Hsys::eInvalidIndex);
    double result = 0;
    ASSERT_EQ(pattern.evaluate(result), Hsys::eSuccess);
    EXPECT_EQ(result, 9) << "the first parameter of a name binds it";

    EXPECT_TRUE(handler.removeParameter(L"a"));
    EXPECT_FALSE(handler.removeParameter(L"zz"));
    EXPECT_EQ(handler.parameterPairVector(), (Parameters{{L"b", 10}, {L"a", 3}}));
    ASSERT_EQ(handler.evaluate(result), Hsys::eSuccess);
    EXPECT_EQ(result, 7);

    // A copy takes text and parameters, not the last error of its source.
    handler.setExpression(L"b/0");
    ASSERT_NE(handler.evaluate(result), Hsys::eSuccess);
    ZyrExpressionHandler copy;
    copy.addParameter(L"old", 1);
    copy = handler;
    EXPECT_EQ(copy.expression(), L"b/0");
    EXPECT_EQ(copy.parameterPairVector(), handler.parameterPairVector());
    EXPECT_TRUE(copy.lastError().IsEmpty());
    handler.removeAll();
    EXPECT_FALSE(handler.has(L"b"));
}

} // namespace
