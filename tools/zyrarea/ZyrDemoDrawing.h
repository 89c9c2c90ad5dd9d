// The tool's sample drawing: a small floor plan whose figures a reader can check by hand.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

class HsDbDatabase;

class ZyrDemoDrawing {
public:
    ZyrDemoDrawing() = delete;

    // Adds the plan to a database with the standard records: a house of three floors of rooms and
    // the sample area, in metres shown with two decimals. Two modifier records act on areas: the
    // attic room under the sloping roof counts half, the balcony a quarter through a formula with
    // a named parameter. The module's style and modifier dictionaries are made when missing. The
    // first failure is answered; what was added before it stays.
    [[nodiscard]] static Hsys::ErrorStatus build(HsDbDatabase& database);
};
