// What kind of change an object reports when one of its parameters changes.
#pragma once

struct ZyrParamChangeFlag {
    // A bit set. kAll, all bits set, tells listeners that anything derived from the object may
    // depend on the change; it is what the objects of this system report.
    enum Type : int { kNone = 0, kValue = 1, kGeometry = 2, kDisplay = 4, kAll = -1 };
};
