// The angle constants of the sibling geometry.
#pragma once

#include <numbers>

struct ZyrAngle {
    static constexpr double kPi = std::numbers::pi;
    static constexpr double kHalfPi = std::numbers::pi / 2.0;
    static constexpr double kTwoPi = 2.0 * std::numbers::pi;
};
