// A chain of line and arc segments, each starting where the one before it ends.
#include "platform/base/geom/ZyrGeCompCurve2d.h"

#include <algorithm>
#include <utility>

ZyrGeCompCurve2d::ZyrGeCompCurve2d(const ZyrGeCompCurve2d& other) {
    m_segments.reserve(other.m_segments.size());
    for (const auto& segment : other.m_segments) {
        m_segments.push_back(std::make_unique<ZyrGeSegment2d>(*segment));
    }
}

ZyrGeCompCurve2d& ZyrGeCompCurve2d::operator=(const ZyrGeCompCurve2d& other) {
    if (this != &other) {
        ZyrGeCompCurve2d copy(other);
        m_segments = std::move(copy.m_segments);
    }
    return *this;
}

ZyrGeCompCurve2d::~ZyrGeCompCurve2d() = default;

Hsys::ErrorStatus ZyrGeCompCurve2d::addSegment(ZyrGeSegment2d* segment, bool atEnd) {
    if (segment == nullptr) {
        return Hsys::eNullPointer;
    }
    std::unique_ptr<ZyrGeSegment2d> owned(segment);
    m_segments.insert(atEnd ? m_segments.end() : m_segments.begin(), std::move(owned));
    return Hsys::eSuccess;
}

const ZyrGeSegment2d* ZyrGeCompCurve2d::segment(int index) const {
    return index >= 0 && index < segmentCount() ? m_segments[static_cast<size_t>(index)].get()
                                                : nullptr;
}

ZyrGeSegment2d* ZyrGeCompCurve2d::segment(int index) {
    return const_cast<ZyrGeSegment2d*>(std::as_const(*this).segment(index));
}

double ZyrGeCompCurve2d::length() const {
    double sum = 0.0;
    for (const auto& segment : m_segments) {
        sum += segment->length();
    }
    return sum;
}

bool ZyrGeCompCurve2d::isClosed(const HsGeTol& tol) const {
    if (m_segments.empty()) {
        return false;
    }
    for (size_t index = 0; index < m_segments.size(); ++index) {
        const ZyrGeSegment2d& next = *m_segments[(index + 1) % m_segments.size()];
        if (!m_segments[index]->endPoint().isEqualTo(next.startPoint(), tol)) {
            return false;
        }
    }
    return true;
}

void ZyrGeCompCurve2d::reverse() {
    std::reverse(m_segments.begin(), m_segments.end());
    for (auto& segment : m_segments) {
        segment->reverse();
    }
}

void ZyrGeCompCurve2d::transformBy(const HsGeMatrix3d& matrix) {
    for (auto& segment : m_segments) {
        segment->transformBy(matrix);
    }
}
