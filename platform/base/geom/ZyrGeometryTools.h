// Plane geometry helpers shared by the profile, its decomposition and the area proof.
#pragma once

#include "platform/host/ge/HsGePoint2d.h"

#include <cstddef>
#include <vector>

class HsGeCircArc2d;

namespace Solidra {
struct Point3d;
}

class ZyrGeometryTools {
public:
    // The signed area of the closed polygon through the points: positive counter-clockwise. A
    // repeated first point at the end adds nothing. Summed relative to the first point, so that a
    // room far from the origin keeps the digits of a room near it.
    // Inline: rooms have a handful of vertices, and a call across the library would cost as much as
    // the sum itself.
    static double polygonArea(const std::vector<HsGePoint2d>& points);
    // True if a, b, c turn strictly counter-clockwise; collinear points do not.
    static bool isCCW(const HsGePoint2d& a, const HsGePoint2d& b, const HsGePoint2d& c);
    // Replaces the content of points3d with the 2D points at height z; returns their number.
    static int convert(const std::vector<HsGePoint2d>& points2d,
                       std::vector<Solidra::Point3d>& points3d, double z);
    // The unsigned area between the arc and its chord. radius and includedAngle (radians) receive
    // the parameters of the circular segment formula r^2 / 2 * (a - sin(a)), which gives it.
    static double arcSegmentArea(const HsGeCircArc2d& arc, double& radius, double& includedAngle);
    // r^2 / 2 * (a - sin(a)) for an angle in [0, 2 pi], without the cancellation of the
    // difference at small angles.
    static double circularSegmentArea(double radius, double includedAngle);
};

inline double ZyrGeometryTools::polygonArea(const std::vector<HsGePoint2d>& points) {
    if (points.size() < 3) {
        return 0.0;
    }
    // A fan from the first point: its own two edges add nothing, and every other point is moved
    // to it once.
    const HsGePoint2d& origin = points.front();
    HsGeVector2d previous = points[1] - origin;
    double twiceArea = 0.0;
    for (std::size_t index = 2; index < points.size(); ++index) {
        const HsGeVector2d current = points[index] - origin;
        twiceArea += previous.crossProduct(current);
        previous = current;
    }
    return twiceArea / 2.0;
}
