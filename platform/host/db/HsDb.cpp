#include "platform/host/db/HsDb.h"

namespace HsDb {

const char* toString(OpenMode mode) {
    switch (mode) {
    case kForRead:
        return "kForRead";
    case kForWrite:
        return "kForWrite";
    case kForNotify:
        return "kForNotify";
    }
    return "unknown open mode";
}

const char* toString(FilerType type) {
    switch (type) {
    case kFileFiler:
        return "kFileFiler";
    case kCopyFiler:
        return "kCopyFiler";
    case kUndoFiler:
        return "kUndoFiler";
    }
    return "unknown filer type";
}

const char* toString(UnitsValue units) {
    switch (units) {
    case kUnitsUnitless:
        return "kUnitsUnitless";
    case kUnitsMillimeters:
        return "kUnitsMillimeters";
    case kUnitsCentimeters:
        return "kUnitsCentimeters";
    case kUnitsMeters:
        return "kUnitsMeters";
    case kUnitsKilometers:
        return "kUnitsKilometers";
    case kUnitsInches:
        return "kUnitsInches";
    case kUnitsFeet:
        return "kUnitsFeet";
    }
    return "unknown units";
}

double metersPerUnit(UnitsValue units) {
    switch (units) {
    case kUnitsUnitless:
        return 1.0;
    case kUnitsMillimeters:
        return 0.001;
    case kUnitsCentimeters:
        return 0.01;
    case kUnitsMeters:
        return 1.0;
    case kUnitsKilometers:
        return 1000.0;
    case kUnitsInches:
        return 0.0254;
    case kUnitsFeet:
        return 0.3048;
    }
    return 0.0;
}

} // namespace HsDb
