// How an object is to be scaled: a factor per axis.
#pragma once

#include <cmath>

// Factors may be negative (a mirror); what an object does with the sign is its own affair.
struct ZyrScaleInfo {
    double x = 1.0;
    double y = 1.0;
    double z = 1.0;

    // True when no factor is zero or not finite: such a scale cannot be undone.
    bool isValid() const {
        return std::isfinite(x) && std::isfinite(y) && std::isfinite(z) && x != 0.0 && y != 0.0 &&
               z != 0.0;
    }
};
