// A chain of line and arc segments, each starting where the one before it ends.
#pragma once

#include "platform/base/geom/ZyrGeSegment2d.h"
#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <memory>
#include <vector>

class HsGeMatrix3d;

class ZyrGeCompCurve2d {
public:
    ZyrGeCompCurve2d() = default;
    // Copies every segment.
    ZyrGeCompCurve2d(const ZyrGeCompCurve2d& other);
    ZyrGeCompCurve2d& operator=(const ZyrGeCompCurve2d& other);
    ZyrGeCompCurve2d(ZyrGeCompCurve2d&&) noexcept = default;
    ZyrGeCompCurve2d& operator=(ZyrGeCompCurve2d&&) noexcept = default;
    virtual ~ZyrGeCompCurve2d();

    // Takes the segment over and puts it after the last segment, or before the first when atEnd
    // is false. Whether it joins its neighbour is not checked here; isClosed tells later.
    [[nodiscard]] Hsys::ErrorStatus addSegment(ZyrGeSegment2d* segment, bool atEnd = true);
    int segmentCount() const { return static_cast<int>(m_segments.size()); }
    // Null outside [0, segmentCount()).
    const ZyrGeSegment2d* segment(int index) const;
    ZyrGeSegment2d* segment(int index);
    void clear() { m_segments.clear(); }

    double length() const;
    // Whether each segment starts where the one before it ends and the last ends at the first's
    // start. A chain without segments is not closed.
    bool isClosed(const HsGeTol& tol = HsGeContext::gTol) const;
    // Runs the chain the other way round: segment order and every segment reversed.
    void reverse();
    void transformBy(const HsGeMatrix3d& matrix);

protected:
    const std::vector<std::unique_ptr<ZyrGeSegment2d>>& segments() const { return m_segments; }

private:
    std::vector<std::unique_ptr<ZyrGeSegment2d>> m_segments;
};
