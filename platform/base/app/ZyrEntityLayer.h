// Puts entities on the layer their kind belongs to: each kind names its layer by a key ("AREA"),
// and the layer of that name is made when the drawing lacks it.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

class HsDbDatabase;
class HsDbEntity;
class ZyrDbEntity;

namespace Zyr {

// The layer of the entity's getLayerKey. See the form with a key.
Hsys::ErrorStatus setLayer(ZyrDbEntity* entity, HsDbDatabase* database = nullptr);

// Puts the entity on the layer named layerKey, made in the layer table when missing (names compare
// without regard to A-Z case, so an existing "Area" serves the key "AREA"). The layer is looked up
// in the entity's database; an entity in none (a sample) takes the given database, and a null one
// stands for the working database. An empty key leaves the entity where it is. eNullPointer for
// a null entity, eNotOpenForWrite when it may not be written, eNoDatabase without a database;
// a failure to open or extend the layer table is returned and leaves the entity as it was.
Hsys::ErrorStatus setLayer(HsDbEntity* entity, const wchar_t* layerKey, HsDbDatabase* database);

} // namespace Zyr
