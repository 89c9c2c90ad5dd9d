// An axis-aligned box that grows to take in the points given to it.
#include "platform/base/geom/ZyrGeBoundBox3d.h"

#include <algorithm>
#include <limits>

namespace {
constexpr double kHighest = std::numeric_limits<double>::max();
constexpr double kLowest = std::numeric_limits<double>::lowest();
} // namespace

// Finite limits rather than infinities, so that arithmetic on an empty box gives no NaN.
ZyrGeBoundBox3d::ZyrGeBoundBox3d()
    : m_min(kHighest, kHighest, kHighest), m_max(kLowest, kLowest, kLowest) {}

bool ZyrGeBoundBox3d::isEmpty() const {
    return m_min.x > m_max.x;
}

void ZyrGeBoundBox3d::addPoint(const HsGePoint3d& point) {
    m_min = {std::min(m_min.x, point.x), std::min(m_min.y, point.y), std::min(m_min.z, point.z)};
    m_max = {std::max(m_max.x, point.x), std::max(m_max.y, point.y), std::max(m_max.z, point.z)};
}
