// The one form of the standard record getters of the module's dictionaries.
#pragma once

#include "platform/host/db/HsDbObjectId.h"

class HsDbDatabase;

namespace Zyr {

// The standard record of Dict's dictionary in the database; the null id when the database lacks
// a valid dictionary, which is not made here.
template <class Dict> HsDbObjectId standardRecordOf(HsDbDatabase* database) {
    Dict dictionary(database);
    return dictionary.isValid(false, false) ? dictionary.standardRecord() : HsDbObjectId::kNull;
}

} // namespace Zyr
