// Plane geometry helpers shared by the profile, its decomposition and the area proof.
#include "platform/base/geom/ZyrGeometryTools.h"

#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/solid/SolidraPoint3d.h"

#include <cmath>

namespace {

// a - sin(a); below 0.1 the difference of nearly equal numbers would lose up to half the
// digits, so the Taylor series takes over (its next term is below 1e-19 there).
double angleMinusSine(double angle) {
    if (angle >= 0.1) {
        return angle - std::sin(angle);
    }
    const double squared = angle * angle;
    return angle * squared / 6.0 *
           (1.0 - squared / 20.0 * (1.0 - squared / 42.0 * (1.0 - squared / 72.0)));
}

} // namespace

bool ZyrGeometryTools::isCCW(const HsGePoint2d& a, const HsGePoint2d& b, const HsGePoint2d& c) {
    return (b - a).crossProduct(c - a) > 0.0;
}

int ZyrGeometryTools::convert(const std::vector<HsGePoint2d>& points2d,
                              std::vector<Solidra::Point3d>& points3d, double z) {
    points3d.clear();
    points3d.reserve(points2d.size());
    for (const HsGePoint2d& point : points2d) {
        points3d.push_back({point.x, point.y, z});
    }
    return static_cast<int>(points3d.size());
}

double ZyrGeometryTools::arcSegmentArea(const HsGeCircArc2d& arc, double& radius,
                                        double& includedAngle) {
    radius = arc.radius();
    includedAngle = arc.includedAngle();
    return circularSegmentArea(radius, includedAngle);
}

double ZyrGeometryTools::circularSegmentArea(double radius, double includedAngle) {
    return radius * radius / 2.0 * angleMinusSine(includedAngle);
}
