// Values of a drawing as the user reads them: converted from drawing units to the display units
// of the database, rounded to its display precision, with the unit's symbol.
#pragma once

class HsDbDatabase;
class ZyrRmCString;

namespace Zyr {

// Asks for the database's display unit or display precision.
inline constexpr int kDrawingDisplaySetting = -1;

// An area in square drawing units as square display units: returns the converted number and writes
// it as text ("12.50 m²"). A null database stands for the working database; with none at all the
// number is kept and shown with two decimals and no unit. Nothing is converted, and no unit shown,
// when the drawing or the display is unitless.
double formatAreaForDisplay(HsDbDatabase* database, double area, ZyrRmCString& text);

// A length in drawing units, in the given unit (an HsDb::UnitsValue) with the given number of
// decimals (0 to 8); kDrawingDisplaySetting, or a number outside those ranges, takes the database's
// own setting. Returns the converted number and writes it as text ("3.25 m").
double formatDistanceForDisplay(HsDbDatabase* database, double length, ZyrRmCString& text,
                                int unit = kDrawingDisplaySetting,
                                int precision = kDrawingDisplaySetting);

} // namespace Zyr
