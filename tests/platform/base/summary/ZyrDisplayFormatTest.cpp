// Areas and distances as the user reads them, across drawing and display units.
#include "platform/base/summary/ZyrDisplayFormat.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"

#include <gtest/gtest.h>

namespace {

constexpr int kDrawing = Zyr::kDrawingDisplaySetting;

TEST(ZyrDisplayFormat, valuesGoFromDrawingUnitsToTheAskedOrDisplayUnits) {
    const struct {
        HsDb::UnitsValue drawing, display;
        int precision;
        bool area;
        double value;
        int unit, decimals;
        double expected;
        const wchar_t* text;
    } cases[] = {
        {HsDb::kUnitsMillimeters, HsDb::kUnitsMeters, 2, true, 12'345'678.0, kDrawing, kDrawing,
         12.345678, L"12.35 m\u00b2"},
        {HsDb::kUnitsMeters, HsDb::kUnitsCentimeters, 0, true, 1.5, kDrawing, kDrawing, 15'000.0,
         L"15000 cm\u00b2"},
        {HsDb::kUnitsFeet, HsDb::kUnitsInches, 1, true, 2.0, kDrawing, kDrawing, 288.0,
         L"288.0 in\u00b2"},
        {HsDb::kUnitsMeters, HsDb::kUnitsMeters, 3, true, -0.0004, kDrawing, kDrawing, -0.0004,
         L"0.000 m\u00b2"},
        {HsDb::kUnitsUnitless, HsDb::kUnitsMeters, 2, true, 7.125, kDrawing, kDrawing, 7.125,
         L"7.13"},
        {HsDb::kUnitsMeters, HsDb::kUnitsUnitless, 4, true, 0.5, kDrawing, kDrawing, 0.5,
         L"0.5000"},
        {HsDb::kUnitsMillimeters, HsDb::kUnitsMeters, 2, false, 1234.6, kDrawing, kDrawing, 1.2346,
         L"1.23 m"},
        {HsDb::kUnitsMillimeters, HsDb::kUnitsMeters, 2, false, 1234.6, HsDb::kUnitsInches, 3,
         48.606299, L"48.606 in"},
        {HsDb::kUnitsMillimeters, HsDb::kUnitsMeters, 2, false, 1234.6, HsDb::kUnitsMillimeters, 0,
         1234.6, L"1235 mm"},
        {HsDb::kUnitsMillimeters, HsDb::kUnitsMeters, 2, false, 1234.6, 99, 9, 1.2346, L"1.23 m"},
    };
    for (const auto& c : cases) {
        HsDbDatabase db;
        db.setDrawingUnits(c.drawing);
        db.setDisplayUnits(c.display);
        ASSERT_EQ(db.setDisplayPrecision(c.precision), Hsys::eSuccess);
        ZyrRmCString text;
        const double shown =
            c.area ? Zyr::formatAreaForDisplay(&db, c.value, text)
                   : Zyr::formatDistanceForDisplay(&db, c.value, text, c.unit, c.decimals);
        EXPECT_NEAR(shown, c.expected, 1e-6) << c.text;
        EXPECT_EQ(text, c.text);
    }
}

TEST(ZyrDisplayFormat, nullDatabaseMeansTheWorkingOneAndWithoutAnyNothingIsConverted) {
    ZyrRmCString text;
    ASSERT_EQ(hsdbHostApplicationServices()->workingDatabase(), nullptr);
    EXPECT_EQ(Zyr::formatAreaForDisplay(nullptr, 2500.0, text), 2500.0);
    EXPECT_EQ(text, L"2500.00");
    HsDbDatabase working;
    working.setDrawingUnits(HsDb::kUnitsCentimeters);
    hsdbHostApplicationServices()->setWorkingDatabase(&working);
    EXPECT_NEAR(Zyr::formatAreaForDisplay(nullptr, 2600.0, text), 0.26, 1e-12);
    EXPECT_EQ(text, L"0.26 m\u00b2");
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
}

} // namespace
