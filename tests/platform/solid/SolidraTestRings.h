// Rings for the modeler's tests and benchmarks: floor-plan rooms and large outlines, all turning
// counter-clockwise in the plane z = 0.
#pragma once

#include "platform/solid/SolidraPoint3d.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <numbers>
#include <vector>

namespace SolidraTestRings {

using Ring = std::vector<Solidra::Point3d>;

// A small deterministic generator, so that every run sees the same shapes.
class Lcg {
public:
    explicit Lcg(std::uint32_t seed) : mState(seed) {}
    // Uniform in [low, high).
    double next(double low, double high) {
        mState = mState * 1664525u + 1013904223u;
        return low + (high - low) * (mState >> 8) / double(1u << 24);
    }

private:
    std::uint32_t mState;
};

inline Ring reversed(Ring ring) {
    std::reverse(ring.begin(), ring.end());
    return ring;
}

inline Ring translated(Ring ring, double dx, double dy) {
    for (Solidra::Point3d& p : ring) {
        p.x += dx;
        p.y += dy;
    }
    return ring;
}

// A room whose far corner is cut into steps: 2 * steps + 2 vertices, a rectangle for one step.
inline Ring staircaseRoom(int steps, std::uint32_t seed) {
    Lcg random(seed);
    Ring ring{{0.0, 0.0, 0.0}};
    double x = 0.0;
    double y = 0.0;
    for (int i = 0; i < steps; ++i) {
        x += std::round(random.next(1.0, 4.0) * 8.0) / 8.0; // walls on an eighth-metre grid
        ring.push_back({x, y, 0.0});
        y += std::round(random.next(1.0, 4.0) * 8.0) / 8.0;
        ring.push_back({x, y, 0.0});
    }
    ring.push_back({0.0, y, 0.0});
    return ring;
}

// Convex, and with many vertices every three neighbours are nearly on one line.
inline Ring regularPolygon(int vertices, double radius) {
    Ring ring;
    for (int i = 0; i < vertices; ++i) {
        const double angle = 2.0 * std::numbers::pi * i / vertices;
        ring.push_back({radius * std::cos(angle), radius * std::sin(angle), 0.0});
    }
    return ring;
}

// Star-shaped about the origin, with random spikes and dents.
inline Ring star(int vertices, std::uint32_t seed) {
    Lcg random(seed);
    Ring ring;
    for (int i = 0; i < vertices; ++i) {
        const double angle = 2.0 * std::numbers::pi * i / vertices;
        const double radius = random.next(20.0, 100.0);
        ring.push_back({radius * std::cos(angle), radius * std::sin(angle), 0.0});
    }
    return ring;
}

// A bar with teeth hanging down: 4 * teeth + 4 vertices, many of them on one line.
inline Ring comb(int teeth) {
    Ring ring{{0.0, 0.0, 0.0}};
    for (int i = 0; i < teeth; ++i) {
        ring.push_back({2.0 * i + 1.0, 0.0, 0.0});
        ring.push_back({2.0 * i + 1.0, -10.0, 0.0});
        ring.push_back({2.0 * i + 2.0, -10.0, 0.0});
        ring.push_back({2.0 * i + 2.0, 0.0, 0.0});
    }
    ring.push_back({2.0 * teeth + 1.0, 0.0, 0.0});
    ring.push_back({2.0 * teeth + 1.0, 5.0, 0.0});
    ring.push_back({0.0, 5.0, 0.0});
    return ring;
}

// A corridor wound into a spiral, out along one wall and back along the other, with points a
// tenth apart: about `vertices` vertices, thin and long, no two walls far from each other.
inline Ring spiral(int vertices) {
    const double pitch = 1.0;
    const double width = 0.5;
    std::vector<double> angles;
    for (double angle = 0.0; static_cast<int>(angles.size()) < vertices / 2;) {
        angles.push_back(angle);
        angle += 0.1 / (1.0 + pitch * angle / (2.0 * std::numbers::pi));
    }
    Ring ring;
    const auto wallPoint = [&](double angle, double inset) {
        const double radius = 1.0 + pitch * angle / (2.0 * std::numbers::pi) - inset;
        return Solidra::Point3d{radius * std::cos(angle), radius * std::sin(angle), 0.0};
    };
    for (double angle : angles)
        ring.push_back(wallPoint(angle, 0.0));
    for (auto angle = angles.rbegin(); angle != angles.rend(); ++angle)
        ring.push_back(wallPoint(*angle, width));
    return ring;
}

} // namespace SolidraTestRings
