#include "platform/base/summary/ZyrDisplayFormat.h"

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/ut/HsutFormat.h"

#include <cmath>

namespace {

constexpr int kMaxPrecision = 8;
constexpr int kPrecisionWithoutDatabase = 2;

// What a value is shown in: the unit, the decimals, and the factor from drawing units.
struct DisplaySetting {
    const wchar_t* symbol = L"";
    int precision = kPrecisionWithoutDatabase;
    double lengthFactor = 1.0;
};

const wchar_t* unitSymbol(HsDb::UnitsValue units) {
    switch (units) {
    case HsDb::kUnitsUnitless:
        return L"";
    case HsDb::kUnitsMillimeters:
        return L"mm";
    case HsDb::kUnitsCentimeters:
        return L"cm";
    case HsDb::kUnitsMeters:
        return L"m";
    case HsDb::kUnitsKilometers:
        return L"km";
    case HsDb::kUnitsInches:
        return L"in";
    case HsDb::kUnitsFeet:
        return L"ft";
    }
    return L"";
}

bool isUnit(int unit) {
    return unit >= HsDb::kUnitsUnitless && unit <= HsDb::kUnitsFeet;
}

// Unitless on either side converts nothing, as the database itself does.
double lengthFactor(HsDb::UnitsValue from, HsDb::UnitsValue to) {
    if (from == HsDb::kUnitsUnitless || to == HsDb::kUnitsUnitless)
        return 1.0;
    return HsDb::metersPerUnit(from) / HsDb::metersPerUnit(to);
}

HsDbDatabase* databaseOrWorking(HsDbDatabase* database) {
    return database != nullptr ? database : hsdbHostApplicationServices()->workingDatabase();
}

DisplaySetting displaySetting(HsDbDatabase* database, int unit, int precision) {
    DisplaySetting setting;
    if (database == nullptr)
        return setting;
    const HsDb::UnitsValue target =
        isUnit(unit) ? static_cast<HsDb::UnitsValue>(unit) : database->displayUnits();
    // A unitless drawing converts nothing, so its values are in no unit a symbol could name.
    if (database->drawingUnits() != HsDb::kUnitsUnitless)
        setting.symbol = unitSymbol(target);
    setting.precision =
        precision >= 0 && precision <= kMaxPrecision ? precision : database->displayPrecision();
    setting.lengthFactor = lengthFactor(database->drawingUnits(), target);
    return setting;
}

// Rounds first, so that a tiny negative value reads "0.00" and not "-0.00".
ZyrRmCString numberText(double value, int precision, const wchar_t* symbol, const wchar_t* power) {
    const double scale = std::pow(10.0, precision);
    double shown = std::round(value * scale) / scale;
    if (shown == 0.0)
        shown = 0.0;
    if (*symbol == L'\0')
        return hsutFormat(L"%.*f", precision, shown);
    return hsutFormat(L"%.*f %s%s", precision, shown, symbol, power);
}

} // namespace

namespace Zyr {

double formatAreaForDisplay(HsDbDatabase* database, double area, ZyrRmCString& text) {
    const DisplaySetting setting =
        displaySetting(databaseOrWorking(database), kDrawingDisplaySetting, kDrawingDisplaySetting);
    const double shown = area * setting.lengthFactor * setting.lengthFactor;
    text = numberText(shown, setting.precision, setting.symbol, L"\u00b2");
    return shown;
}

double formatDistanceForDisplay(HsDbDatabase* database, double length, ZyrRmCString& text, int unit,
                                int precision) {
    const DisplaySetting setting = displaySetting(databaseOrWorking(database), unit, precision);
    const double shown = length * setting.lengthFactor;
    text = numberText(shown, setting.precision, setting.symbol, L"");
    return shown;
}

} // namespace Zyr
