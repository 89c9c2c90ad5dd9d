// Single values of area groups without a calculation stream, and the sample group of style
// previews.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

class HsDbDatabase;
class ZyrDbAreaGroup;

class ZyrAreaGroupDbOperations {
public:
    ZyrAreaGroupDbOperations() = delete;

    // The values of a group's tree for one calculation, added to value (not assigned: a caller
    // starts from 0). A group that does not allow the calculation adds nothing, and nothing below
    // it counts. Direct areas come before child groups, in their stored order; erased members are
    // skipped; a member that fails costs only its share, and the status is that of the last
    // member tried, so a later success hides an earlier failure. The modified forms run each
    // area's modifiers and then the group's over the sum. eNullPointer for a null group.
    static Hsys::ErrorStatus area(const ZyrDbAreaGroup* group, double& value);
    static Hsys::ErrorStatus perimeter(const ZyrDbAreaGroup* group, double& value);
    static Hsys::ErrorStatus areaModified(const ZyrDbAreaGroup* group, double& value);
    static Hsys::ErrorStatus perimeterModified(const ZyrDbAreaGroup* group, double& value);

    // A new, empty group with the drawing's standards and layer, for the previews of a group
    // style. Null stands for the working database. The group is in no database and owned by the
    // caller; null when it cannot be made.
    static ZyrDbAreaGroup* sample(HsDbDatabase* database);
};
