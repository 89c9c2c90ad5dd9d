// The object database's enumerations: open modes, filer kinds, units and database setups.
#pragma once

namespace HsDb {

enum OpenMode { kForRead = 0, kForWrite = 1, kForNotify = 2 };

// Who a filer works for. Objects file the same fields for every kind; a few refuse text filing to a
// file, and undo filers restore objects in place.
enum FilerType { kFileFiler = 0, kCopyFiler = 1, kUndoFiler = 2 };

// Length units of a drawing and of its display. Filed in drawing files: the numbers must stay.
enum UnitsValue {
    kUnitsUnitless = 0,
    kUnitsMillimeters = 1,
    kUnitsCentimeters = 2,
    kUnitsMeters = 3,
    kUnitsKilometers = 4,
    kUnitsInches = 5,
    kUnitsFeet = 6,
};

// What a new database holds: nothing (to be read from a file) or the standard records.
enum DrawingSetup { kEmptyDatabase = 0, kStandardRecords = 1 };

// Whether a database has a transaction manager.
enum TransactionSupport { kNoTransactions = 0, kWithTransactions = 1 };

const char* toString(OpenMode mode);
const char* toString(FilerType type);
const char* toString(UnitsValue units);

// Metres in one unit; 1 for unitless, which converts to nothing. 0 for a number that is no unit.
double metersPerUnit(UnitsValue units);

} // namespace HsDb
