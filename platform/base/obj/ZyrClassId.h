// Class ids of filed classes: a class-id word becomes a stable 128-bit id, derived from the word
// alone, so that every build and every machine gives a class the same id.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/ut/HsGuid.h"
#include "platform/host/ut/HsysErrorStatus.h"

class HsRxClass;

namespace Zyr {

// The full class-id text of a class-id word ("ZyrArea" -> "Zyr.ZyrArea.ClassId").
ZyrRmCString constructClassID(const wchar_t* classIdWord);
// The id of an entity class, and of a non-entity object class, from a full class-id text. The two
// kinds never share an id, even for the same text. eInvalidInput for an empty or null text.
Hsys::ErrorStatus getEntityClassIdFromString(const wchar_t* classIdText, _GUID* id);
Hsys::ErrorStatus getObjectClassIdFromString(const wchar_t* classIdText, _GUID* id);

// The registered class of a name, or null.
HsRxClass* classNameToClass(const wchar_t* className);
// The display name of a class: its decorator's text, else its registered name; empty for null.
void classTypeToDisplayName(const HsRxClass* cls, ZyrRmCString& out);

} // namespace Zyr
