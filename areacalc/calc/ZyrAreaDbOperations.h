// Single values of areas without a calculation stream, and the sample area of style previews.
#pragma once

class HsDbDatabase;
class ZyrDbArea;

class ZyrAreaDbOperations {
public:
    ZyrAreaDbOperations() = delete;

    // The fixed example area that previews of a style show: an outline with a three-quarter arc
    // and a triangular hole, the outline positive and the hole negative, with the drawing's
    // standards and layer. Null stands for the working database. The area is in no database and
    // owned by the caller; null when it cannot be made.
    static ZyrDbArea* sample(HsDbDatabase* database);
};
