// Checks of the ids an object keeps, for audits: each bad id is named, printed and counted.
#pragma once

#include "platform/host/db/HsDbObjectId.h"

#include <vector>

class HsDbAuditInfo;
class HsDbEntity;
class HsDbObject;
class HsRxClass;

// What is wrong with a referenced id: kGoodReference (0) when nothing is, so that every answer
// reads as "nonzero when bad".
enum ZyrReferenceVerdict : int {
    kGoodReference = 0,
    kNullReference = 1,
    // The id belongs to another drawing than the object that keeps it.
    kForeignReference = 2,
    // No object stands behind the id (a handle a damaged drawing referred to).
    kMissingReference = 3,
    kErasedReference = 4,
    kWrongClassReference = 5,
};

const char* toString(ZyrReferenceVerdict verdict);

namespace Zyr {
// The verdict on an id that object keeps to a record of cls (any class for null). allowNull: a
// null id is good; allowErased: an erased object is good. An object in no database accepts ids of
// any drawing.
ZyrReferenceVerdict verifySymbolReference(const HsDbObject* object, const HsDbObjectId& id,
                                          const HsRxClass* cls, int allowNull, int allowErased);
} // namespace Zyr

class ZyrAuditUtilities {
public:
    ZyrAuditUtilities() = delete;

    // The verdict on a style or record id (null, erased, of another class or drawing, or with no
    // object are bad); a bad one is printed through the audit as one line: the object, the class
    // and handle of the id, what is wrong, and "fixed" or "not fixed" as the audit may fix.
    static ZyrReferenceVerdict verifySymbolReferenceAndPrintAuditError(HsDbAuditInfo* info,
                                                                       const HsDbObject* object,
                                                                       const HsDbObjectId& id,
                                                                       const HsRxClass* cls);
    // The same for an id of an entity (a member of a group): the object must also be an entity.
    static ZyrReferenceVerdict verifyEntityReferenceAndPrintAuditError(HsDbAuditInfo* info,
                                                                       const HsDbEntity* entity,
                                                                       const HsDbObjectId& id,
                                                                       const HsRxClass* cls);
    // Counts the bad ids of a list that object keeps (Zyr::verifySymbolReference with allowNull
    // and allowErased), printing a line for each on the console. With fix the bad ids are taken
    // out of the list, the others keeping their order; the caller records the change.
    static int verifySymbolReferences(const HsDbObject* object, std::vector<HsDbObjectId>& ids,
                                      const HsRxClass* cls, int allowNull, int allowErased,
                                      bool fix);
};
