// Single values of area groups without a calculation stream, and the sample group of style
// previews.
#pragma once

class HsDbDatabase;
class ZyrDbAreaGroup;

class ZyrAreaGroupDbOperations {
public:
    ZyrAreaGroupDbOperations() = delete;

    // A new, empty group with the drawing's standards and layer, for the previews of a group
    // style. Null stands for the working database. The group is in no database and owned by the
    // caller; null when it cannot be made.
    static ZyrDbAreaGroup* sample(HsDbDatabase* database);
};
