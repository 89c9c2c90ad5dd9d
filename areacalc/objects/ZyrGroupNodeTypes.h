// The ownership modes of a group: whether it may hold child groups, member areas, both or neither,
// and the label that names a mode.
#pragma once

class HsRxClass;
class ZyrRmCString;

class ZyrGroupNodeTypes {
public:
    // A bit set, filed as uint16: the numbers must stay.
    enum Mode : unsigned short {
        kNoOwner = 0,
        // The group may hold groups (its nodes).
        kNodeOwner = 1,
        // The group may hold areas (its leafs).
        kLeafOwner = 2,
        kNodeAndLeafOwner = 3,
    };
    // The highest mode that may be set; a stream may still carry a higher one.
    static constexpr unsigned short kHighestMode = kNodeAndLeafOwner;

    // The label of a mode: the text for no members for 0; otherwise the display names of the
    // classes it may hold joined by ", ", the node class first. A null class is named by the
    // module's text for a group or an area. A mode above kHighestMode leaves out as it was.
    static void displayName(unsigned short mode, HsRxClass* nodeClass, HsRxClass* leafClass,
                            ZyrRmCString& out);
};
