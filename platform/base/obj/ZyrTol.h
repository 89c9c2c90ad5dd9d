// Tolerances of the sibling layer that are not the host's global one.
#pragma once

struct ZyrTol {
    // Below this a size counts as none: far under any drawing unit, above the noise of doubles
    // that went through a few transformations.
    static constexpr double sTight = 1.0e-10;
};
