// The process-wide geometry settings: the tolerance every comparison takes by default.
#pragma once

#include "platform/host/ge/HsGeTol.h"

struct HsGeContext {
    // Starts at 1e-10 for points and vectors; a host may set it once at start-up.
    static HsGeTol gTol;
};
