// A circular arc in the plane, running from its start point counter-clockwise or clockwise.
#include "platform/host/ge/HsGeCircArc2d.h"

#include "platform/host/ut/HsAssertionViolation.h"

#include <cmath>
#include <numbers>

namespace {

constexpr double kTwoPi = 2.0 * std::numbers::pi;

// The angle brought into [0, 2 pi).
double normalizedAngle(double angle) {
    const double wrapped = std::fmod(angle, kTwoPi);
    const double positive = wrapped < 0.0 ? wrapped + kTwoPi : wrapped;
    return positive >= kTwoPi ? 0.0 : positive;
}

// The counter-clockwise turn from one direction to the other, in (0, 2 pi]: a full turn when
// they coincide, as an arc from a point back to itself is the whole circle.
double counterClockwiseSweep(double fromAngle, double toAngle) {
    const double sweep = normalizedAngle(toAngle - fromAngle);
    return sweep == 0.0 ? kTwoPi : sweep;
}

} // namespace

HsGeCircArc2d::HsGeCircArc2d() : HsGeCircArc2d(HsGePoint2d::kOrigin, 1.0, 0.0, 0.0) {}

HsGeCircArc2d::HsGeCircArc2d(const HsGePoint2d& center, double radius, double startAngle,
                             double endAngle, bool isClockWise)
    : m_center(center), m_radius(radius), m_startAngle(normalizedAngle(startAngle)),
      m_sweep(isClockWise ? -counterClockwiseSweep(endAngle, startAngle)
                          : counterClockwiseSweep(startAngle, endAngle)) {
    m_start = pointAtAngle(m_startAngle);
    m_end = pointAtAngle(m_startAngle + m_sweep);
}

HsGeCircArc2d::HsGeCircArc2d(const HsGePoint2d& start, const HsGePoint2d& pointOnArc,
                             const HsGePoint2d& end) {
    if (!set(start, pointOnArc, end)) {
        throw HsAssertionViolation("HsGeCircArc2d through three collinear points");
    }
}

bool HsGeCircArc2d::set(const HsGePoint2d& start, const HsGePoint2d& pointOnArc,
                        const HsGePoint2d& end, const HsGeTol& tol) {
    // Worked relative to the start point, so that survey coordinates keep their digits.
    const HsGeVector2d toMiddle = pointOnArc - start;
    const HsGeVector2d toEnd = end - start;
    const bool coincident = toMiddle.length() <= tol.equalPoint() ||
                            toEnd.length() <= tol.equalPoint() ||
                            pointOnArc.distanceTo(end) <= tol.equalPoint();
    if (coincident || toMiddle.isParallelTo(toEnd, tol)) {
        return false;
    }
    const double twiceCross = 2.0 * toMiddle.crossProduct(toEnd);
    const double middleSqrd = toMiddle.lengthSqrd();
    const double endSqrd = toEnd.lengthSqrd();
    const HsGeVector2d toCenter((middleSqrd * toEnd.y - endSqrd * toMiddle.y) / twiceCross,
                                (endSqrd * toMiddle.x - middleSqrd * toEnd.x) / twiceCross);
    const HsGeVector2d startRadius = -toCenter;
    const HsGeVector2d endRadius = toEnd - toCenter;
    // Three points met counter-clockwise along the circle turn counter-clockwise.
    const double sweep =
        twiceCross > 0.0 ? startRadius.angleToCCW(endRadius) : -endRadius.angleToCCW(startRadius);
    setAroundCenter(start + toCenter, start, end, sweep);
    return true;
}

bool HsGeCircArc2d::setFromBulge(const HsGePoint2d& start, const HsGePoint2d& end, double bulge,
                                 const HsGeTol& tol) {
    const HsGeVector2d chord = end - start;
    if (bulge == 0.0 || !std::isfinite(bulge) || chord.length() <= tol.equalPoint()) {
        return false;
    }
    // The center lies on the chord's perpendicular bisector, left of the chord by half the chord
    // times the cotangent of half the angle, which is (1 - b^2) / (2 b).
    const HsGeVector2d toCenter =
        chord * 0.5 + chord.perpVector() * ((1.0 - bulge * bulge) / (4.0 * bulge));
    setAroundCenter(start + toCenter, start, end, 4.0 * std::atan(bulge));
    return true;
}

void HsGeCircArc2d::setAroundCenter(const HsGePoint2d& center, const HsGePoint2d& start,
                                    const HsGePoint2d& end, double sweep) {
    const HsGeVector2d startRadius = start - center;
    m_center = center;
    m_radius = startRadius.length();
    m_startAngle = normalizedAngle(std::atan2(startRadius.y, startRadius.x));
    m_sweep = sweep;
    m_start = start;
    m_end = end;
}

double HsGeCircArc2d::endAng() const {
    return normalizedAngle(m_startAngle + m_sweep);
}

double HsGeCircArc2d::includedAngle() const {
    return std::abs(m_sweep);
}

double HsGeCircArc2d::bulge() const {
    return std::tan(m_sweep / 4.0);
}

double HsGeCircArc2d::length() const {
    return m_radius * includedAngle();
}

bool HsGeCircArc2d::spansAngle(double angle) const {
    const double turned = isClockWise() ? normalizedAngle(m_startAngle - angle)
                                        : normalizedAngle(angle - m_startAngle);
    return turned <= includedAngle();
}

HsGePoint2d HsGeCircArc2d::closestPointTo(const HsGePoint2d& point, const HsGeTol& tol) const {
    const HsGeVector2d fromCenter = point - m_center;
    // Every point of the circle is as near to its center; the start point answers for them.
    if (fromCenter.isZeroLength(tol)) {
        return m_start;
    }
    if (spansAngle(std::atan2(fromCenter.y, fromCenter.x))) {
        return m_center + fromCenter.normal(tol) * m_radius;
    }
    return point.distanceTo(m_start) <= point.distanceTo(m_end) ? m_start : m_end;
}

HsGePoint2d HsGeCircArc2d::pointAtAngle(double angle) const {
    return m_center + HsGeVector2d(std::cos(angle), std::sin(angle)) * m_radius;
}
