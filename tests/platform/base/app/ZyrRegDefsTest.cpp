// Application settings: stored lengths in millimetres read in a drawing's units, defaults by unit
// system, and handles that only read.
#include "platform/base/app/ZyrRegDefs.h"
#include "platform/base/app/ZyrAppHdx.h"
#include "platform/host/db/HsDbDatabase.h"

#include <gtest/gtest.h>

namespace {

AFX_EXTENSION_MODULE gExtension;
AFX_EXTENSION_MODULE gOtherExtension;
ZyrAppHdx gApp(L"RegDefsTest80", &gExtension, gExtension, L"RegDefsTest");
ZyrAppHdx gOtherApp(L"OtherApp80", &gOtherExtension, gOtherExtension, L"OtherApp");

TEST(ZyrRegDefs, storedMillimetresAndSystemDefaultsComeInDrawingUnits) {
    HsDbDatabase db;
    db.setDrawingUnits(HsDb::kUnitsMillimeters);
    ZyrRegDefsStandardObj writer(&db, &gApp, L"AreaGroup", true);
    ASSERT_EQ(writer.setUnitDependentDouble(L"MarkerWidth", 500.0), Hsys::eSuccess);
    const struct {
        HsDb::UnitsValue units;
        bool imperial;
        double width; // stored 500 mm
        double depth; // default 100 in the unit system's base unit (mm or in)
    } cases[] = {
        {HsDb::kUnitsMillimeters, false, 500.0, 100.0},
        {HsDb::kUnitsMeters, false, 0.5, 0.1},
        {HsDb::kUnitsKilometers, false, 0.0005, 0.0001},
        {HsDb::kUnitsInches, true, 500.0 / 25.4, 100.0},
        {HsDb::kUnitsFeet, true, 500.0 / 304.8, 100.0 / 12.0},
        {HsDb::kUnitsUnitless, false, 500.0, 100.0},
    };
    for (const auto& c : cases) {
        db.setDrawingUnits(c.units);
        const ZyrRegDefsStandardObj reader(&db, &gApp, L"AreaGroup", false);
        EXPECT_EQ(reader.isImperial(), c.imperial) << HsDb::toString(c.units);
        EXPECT_NEAR(reader.getUnitDependentDouble(L"MarkerWidth", 1.0, true), c.width, 1e-12);
        EXPECT_NEAR(reader.getUnitDependentDouble(L"MarkerDepth", 100.0, true), c.depth, 1e-12);
        EXPECT_EQ(reader.getUnitDependentDouble(L"MarkerHeight", 7.0, false), 7.0);
    }
    db.setDrawingUnits(HsDb::kUnitsMeters);
    ASSERT_EQ(writer.setUnitDependentDouble(L"MarkerWidth", 2.0), Hsys::eSuccess);
    EXPECT_EQ(writer.getDouble(L"MarkerWidth", 0.0), 2000.0);
    EXPECT_FALSE(ZyrRegDefsStandardObj(nullptr, &gApp, L"AreaGroup", false).isImperial());
}

TEST(ZyrRegDefs, settingsAreKeptPerApplicationAndKeyAndReadOnlyHandlesRefuse) {
    ZyrRegDefsStandardObj mine(nullptr, &gApp, L"Key", true);
    const ZyrRegDefsStandardObj readOnly(nullptr, &gApp, L"Key", false);
    ASSERT_EQ(mine.setDouble(L"Value", 3.5), Hsys::eSuccess);
    EXPECT_EQ(readOnly.getDouble(L"Value", 0.0), 3.5);
    EXPECT_FALSE(ZyrRegDefsStandardObj(nullptr, &gApp, L"Other", false).has(L"Value"));
    EXPECT_FALSE(ZyrRegDefsStandardObj(nullptr, &gOtherApp, L"Key", false).has(L"Value"));
    ZyrRegDefsStandardObj refusing(nullptr, &gApp, L"Key", false);
    EXPECT_EQ(refusing.setDouble(L"Value", 9.0), Hsys::eNotOpenForWrite);
    EXPECT_EQ(refusing.remove(L"Value"), Hsys::eNotOpenForWrite);
    EXPECT_EQ(mine.setDouble(L"", 1.0), Hsys::eNullPointer);
    EXPECT_EQ(readOnly.getDouble(L"Value", 0.0), 3.5);
    ASSERT_EQ(mine.remove(L"Value"), Hsys::eSuccess);
    EXPECT_EQ(mine.remove(L"Value"), Hsys::eNameNotFound);
    EXPECT_EQ(readOnly.getDouble(L"Value", -1.0), -1.0);
}

} // namespace
