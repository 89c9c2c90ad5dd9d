// Fixed numbers for classes whose objects are filed nested inside others: a number is shorter and
// survives a renamed class. The numbers are part of the file format.
#pragma once

#include <map>

class HsRxClass;

class ZyrClassIdManager {
public:
    // Ties a class to a number. False, and nothing changed, when the class or the number is taken
    // or the class is null.
    static bool append(HsRxClass* cls, unsigned short classId);
    // Forgets a class and its number; false when it was not known.
    static bool remove(HsRxClass* cls);
    // The number of a class; false when it has none.
    static bool classId(const HsRxClass* cls, unsigned short& classId);
    // The class of a number, or null.
    static HsRxClass* classFor(unsigned short classId);
};
