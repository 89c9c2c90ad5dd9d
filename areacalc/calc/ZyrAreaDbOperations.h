// Single values of areas without a calculation stream, and the sample area of style previews.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

class HsDbDatabase;
class HsDbObjectId;
class ZyrDbArea;

class ZyrAreaDbOperations {
public:
    ZyrAreaDbOperations() = delete;

    // The gross values of an area. eNullPointer for null, the value unwritten.
    static Hsys::ErrorStatus area(ZyrDbArea* area, double& value);
    static Hsys::ErrorStatus perimeter(ZyrDbArea* area, double& value);
    // The values run through the area's modifiers for the area or the perimeter calculation; the
    // status of the last modifier that ran. There is no null test here: a caller passes an area.
    static Hsys::ErrorStatus areaModified(ZyrDbArea* area, double& value);
    static Hsys::ErrorStatus perimeterModified(ZyrDbArea* area, double& value);
    // The same by id: the area is opened for read for the one value and closed again (deleted
    // instead when it has no id). A failed open gives its status with the value as it was.
    static Hsys::ErrorStatus area(const HsDbObjectId& id, double& value);
    static Hsys::ErrorStatus perimeter(const HsDbObjectId& id, double& value);
    static Hsys::ErrorStatus areaModified(const HsDbObjectId& id, double& value);
    static Hsys::ErrorStatus perimeterModified(const HsDbObjectId& id, double& value);

    // The fixed example area that previews of a style show: an outline with a three-quarter arc
    // and a triangular hole, the outline positive and the hole negative, with the drawing's
    // standards and layer. Null stands for the working database. The area is in no database and
    // owned by the caller; null when it cannot be made.
    static ZyrDbArea* sample(HsDbDatabase* database);
};
