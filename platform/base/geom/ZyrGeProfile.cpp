// A closed outline in the plane: owned rings, where positive rings add area and negative rings
// are holes.
#include "platform/base/geom/ZyrGeProfile.h"

#include "platform/base/geom/ZyrGeBoundBox3d.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeMatrix3d.h"
#include "platform/host/rx/HsRxClass.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <utility>

HSRX_DEFINE_MEMBERS(ZyrGeProfile, ZyrImpObj, 0, hsrxInstantiateClass<ZyrGeProfile>)

namespace {

constexpr int kExtentRounds = 20;
// A segment is filed as two points and a bulge, a ring as its segment count and its segments.
constexpr std::size_t kFiledSegmentSize = 5 * sizeof(double);
constexpr std::size_t kMinFiledRingSize = sizeof(std::uint32_t);

// A count of items of at least itemSize bytes each, refused when the bytes left cannot hold them.
Hsys::ErrorStatus readCount(HsDbBdfFiler* filer, std::size_t itemSize, std::uint32_t& count) {
    std::uint32_t candidate = 0;
    if (filer->readUInt32(candidate) != Hsys::eSuccess) {
        return filer->filerStatus();
    }
    if (candidate > filer->remaining() / itemSize) {
        filer->setFilerStatus(Hsys::eFilerError);
        return filer->filerStatus();
    }
    count = candidate;
    return Hsys::eSuccess;
}

bool isValidRing(const ZyrGeRing& ring, const HsGeTol& tol) {
    for (int index = 0; index < ring.segmentCount(); ++index) {
        const ZyrGeSegment2d& segment = *ring.segment(index);
        if (!segment.isFinite() || segment.length() <= tol.equalPoint()) {
            return false;
        }
    }
    return ring.isClosed(tol) && 2.0 * std::abs(ring.area()) > tol.equalPoint() * ring.length();
}

// A segment of the profile with where it stands, for the crossing search.
struct PlacedSegment {
    const ZyrGeSegment2d* segment;
    int ring;
    int position;
    ZyrGeBoundBox3d box;
};

bool areNeighbours(const PlacedSegment& a, const PlacedSegment& b, int segmentsInRing) {
    if (a.ring != b.ring) {
        return false;
    }
    const int gap = std::abs(a.position - b.position);
    return gap == 1 || gap == segmentsInRing - 1;
}

// Neighbours may meet only at the joints they share; any other pair may not meet at all.
bool meetsWrongly(const PlacedSegment& a, const PlacedSegment& b, bool neighbours,
                  const HsGeTol& tol) {
    const ZyrGeSegment2d::Contact contact = a.segment->intersectWith(*b.segment, tol);
    if (contact.overlapping) {
        return true;
    }
    for (int index = 0; index < contact.count; ++index) {
        const HsGePoint2d& point = contact.points[index];
        const bool atJoint = (point.isEqualTo(a.segment->endPoint(), tol) &&
                              point.isEqualTo(b.segment->startPoint(), tol)) ||
                             (point.isEqualTo(a.segment->startPoint(), tol) &&
                              point.isEqualTo(b.segment->endPoint(), tol));
        if (!neighbours || !atJoint) {
            return true;
        }
    }
    return false;
}

} // namespace

ZyrGeProfile::ZyrGeProfile() = default;

ZyrGeProfile::ZyrGeProfile(const ZyrGeProfile& other)
    : ZyrImpObj(), m_left(other.m_left), m_top(other.m_top), m_right(other.m_right),
      m_bottom(other.m_bottom), m_extentsStale(other.m_extentsStale) {
    m_rings.reserve(other.m_rings.size());
    for (const auto& ring : other.m_rings) {
        m_rings.push_back(std::make_unique<ZyrGeRing>(*ring));
    }
}

ZyrGeProfile& ZyrGeProfile::operator=(const ZyrGeProfile& other) {
    if (this != &other) {
        ZyrGeProfile copy(other);
        assertParentWriteEnabled();
        m_rings = std::move(copy.m_rings);
        m_left = copy.m_left;
        m_top = copy.m_top;
        m_right = copy.m_right;
        m_bottom = copy.m_bottom;
        m_extentsStale = copy.m_extentsStale;
    }
    return *this;
}

ZyrGeProfile::~ZyrGeProfile() = default;

Hsys::ErrorStatus ZyrGeProfile::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpObj::copyFrom(other); status != Hsys::eSuccess) {
        return status;
    }
    const ZyrGeProfile* source = ZyrGeProfile::cast(other);
    if (source == nullptr) {
        return Hsys::eBadArgument;
    }
    *this = *source;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrGeProfile::addRing(ZyrGeRing* ring) {
    if (ring == nullptr) {
        return Hsys::eNullPointer;
    }
    std::unique_ptr<ZyrGeRing> owned(ring);
    assertParentWriteEnabled();
    m_rings.push_back(std::move(owned));
    m_extentsStale = true;
    return Hsys::eSuccess;
}

const ZyrGeRing* ZyrGeProfile::ring(int index) const {
    return index >= 0 && index < ringCount() ? m_rings[static_cast<size_t>(index)].get() : nullptr;
}

ZyrGeRing* ZyrGeProfile::ring(int index) {
    m_extentsStale = true;
    return const_cast<ZyrGeRing*>(std::as_const(*this).ring(index));
}

void ZyrGeProfile::removeAllRings() {
    assertParentWriteEnabled();
    m_rings.clear();
    m_extentsStale = true;
}

double ZyrGeProfile::area(double tol) const {
    double sum = 0.0;
    for (const auto& ring : m_rings) {
        const double ringArea = ring->area();
        if (std::abs(ringArea) > tol) {
            sum += ringArea;
        }
    }
    return sum;
}

bool ZyrGeProfile::isValidProfile(bool checkCrossings) const {
    const HsGeTol& tol = HsGeContext::gTol;
    const bool ringsValid = std::all_of(m_rings.begin(), m_rings.end(),
                                        [&](const auto& ring) { return isValidRing(*ring, tol); });
    return ringsValid && !(checkCrossings && hasCrossings(tol));
}

bool ZyrGeProfile::hasCrossings(const HsGeTol& tol) const {
    std::vector<PlacedSegment> placed;
    for (int ringIndex = 0; ringIndex < ringCount(); ++ringIndex) {
        const ZyrGeRing& ring = *m_rings[static_cast<size_t>(ringIndex)];
        for (int position = 0; position < ring.segmentCount(); ++position) {
            PlacedSegment entry{ring.segment(position), ringIndex, position, {}};
            entry.segment->addExtents(entry.box);
            placed.push_back(entry);
        }
    }
    // Sweep along x: only segments whose boxes overlap in x (widened by the tolerance) are
    // intersected, which keeps a floor plan near linear instead of testing every pair.
    std::sort(placed.begin(), placed.end(), [](const PlacedSegment& a, const PlacedSegment& b) {
        return a.box.minPoint().x < b.box.minPoint().x;
    });
    const double slack = tol.equalPoint();
    for (size_t first = 0; first < placed.size(); ++first) {
        const PlacedSegment& a = placed[first];
        for (size_t second = first + 1; second < placed.size(); ++second) {
            const PlacedSegment& b = placed[second];
            if (b.box.minPoint().x > a.box.maxPoint().x + slack) {
                break;
            }
            if (b.box.minPoint().y > a.box.maxPoint().y + slack ||
                a.box.minPoint().y > b.box.maxPoint().y + slack) {
                continue;
            }
            const bool neighbours =
                areNeighbours(a, b, m_rings[static_cast<size_t>(a.ring)]->segmentCount());
            if (meetsWrongly(a, b, neighbours, tol)) {
                return true;
            }
        }
    }
    return false;
}

Hsys::ErrorStatus ZyrGeProfile::scale(double xFactor, double yFactor) {
    if (xFactor == 0.0 || yFactor == 0.0 || !std::isfinite(xFactor) || !std::isfinite(yFactor)) {
        return Hsys::eInvalidInput;
    }
    transformBy(HsGeMatrix3d::scaling(xFactor, yFactor, 1.0));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrGeProfile::setExtent(double width, double height) {
    updateExtents();
    if (width == 0.0 || height == 0.0 || !std::isfinite(width) || !std::isfinite(height) ||
        m_right <= m_left || m_top <= m_bottom) {
        return Hsys::eInvalidInput;
    }
    // A stretched arc stays circular, so its extreme points do not move as the corners do and
    // the first scale misses the size a little; a few further rounds close in on it, and the
    // corner is put back at the end. A profile of lines is done after the first round.
    const HsGePoint3d corner(m_left, m_bottom, 0.0);
    const double targetWidth = std::abs(width);
    const double targetHeight = std::abs(height);
    const double tol = HsGeContext::gTol.equalPoint();
    for (int round = 0; round < kExtentRounds; ++round) {
        const double currentWidth = m_right - m_left;
        const double currentHeight = m_top - m_bottom;
        if (std::abs(currentWidth - targetWidth) <= tol &&
            std::abs(currentHeight - targetHeight) <= tol) {
            break;
        }
        transformBy(HsGeMatrix3d::scaling(targetWidth / currentWidth, targetHeight / currentHeight,
                                          1.0, HsGePoint3d(m_left, m_bottom, 0.0)));
        updateExtents();
    }
    transformBy(HsGeMatrix3d::translation(corner - HsGePoint3d(m_left, m_bottom, 0.0)));
    m_extentsStale = true;
    return Hsys::eSuccess;
}

void ZyrGeProfile::transformBy(const HsGeMatrix3d& matrix) {
    assertParentWriteEnabled();
    const bool mirrors = matrix(0, 0) * matrix(1, 1) - matrix(0, 1) * matrix(1, 0) < 0.0;
    for (auto& ring : m_rings) {
        ring->transformBy(matrix);
        if (mirrors) {
            ring->reverse();
        }
    }
    m_extentsStale = true;
}

void ZyrGeProfile::updateExtents() {
    ZyrGeBoundBox3d box;
    for (const auto& ring : m_rings) {
        for (int index = 0; index < ring->segmentCount(); ++index) {
            ring->segment(index)->addExtents(box);
        }
    }
    const bool empty = box.isEmpty();
    m_left = empty ? 0.0 : box.minPoint().x;
    m_bottom = empty ? 0.0 : box.minPoint().y;
    m_right = empty ? 0.0 : box.maxPoint().x;
    m_top = empty ? 0.0 : box.maxPoint().y;
    m_extentsStale = false;
}

Hsys::ErrorStatus ZyrGeProfile::bdfOutFields(HsDbBdfFiler* filer) const {
    return Zyr::bdfOutLevel(
        filer, [&] { return ZyrImpObj::bdfOutFields(filer); }, [&] { return bdfOutVersion(filer); },
        [&] { return bdfOutOwnFields(filer); });
}

Hsys::ErrorStatus ZyrGeProfile::bdfOutOwnFields(HsDbBdfFiler* filer) const {
    filer->writeUInt32(static_cast<std::uint32_t>(m_rings.size()));
    for (const auto& ring : m_rings) {
        filer->writeUInt32(static_cast<std::uint32_t>(ring->segmentCount()));
        for (int index = 0; index < ring->segmentCount(); ++index) {
            const ZyrGeSegment2d& segment = *ring->segment(index);
            filer->writePoint2d(segment.startPoint());
            filer->writePoint2d(segment.endPoint());
            filer->writeDouble(segment.bulge());
        }
    }
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrGeProfile::bdfInFields(HsDbBdfFiler* filer) {
    return Zyr::bdfInLevel(
        filer, this, ZyrGeProfile::desc(), [&] { return ZyrImpObj::bdfInFields(filer); },
        [&] { return bdfInVersion(filer); }, [&] { return bdfInOwnFields(filer); });
}

Hsys::ErrorStatus ZyrGeProfile::bdfInOwnFields(HsDbBdfFiler* filer) {
    std::uint32_t ringTotal = 0;
    if (readCount(filer, kMinFiledRingSize, ringTotal) != Hsys::eSuccess) {
        return filer->filerStatus();
    }
    std::vector<std::unique_ptr<ZyrGeRing>> rings;
    rings.reserve(ringTotal);
    for (std::uint32_t index = 0; index < ringTotal; ++index) {
        auto ring = std::make_unique<ZyrGeRing>();
        if (readRing(filer, *ring) != Hsys::eSuccess) {
            return filer->filerStatus();
        }
        rings.push_back(std::move(ring));
    }
    m_rings = std::move(rings);
    m_extentsStale = true;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrGeProfile::readRing(HsDbBdfFiler* filer, ZyrGeRing& ring) {
    std::uint32_t segmentTotal = 0;
    if (readCount(filer, kFiledSegmentSize, segmentTotal) != Hsys::eSuccess) {
        return filer->filerStatus();
    }
    for (std::uint32_t index = 0; index < segmentTotal; ++index) {
        HsGePoint2d start;
        HsGePoint2d end;
        double bulge = 0.0;
        filer->readPoint2d(start);
        filer->readPoint2d(end);
        if (filer->readDouble(bulge) != Hsys::eSuccess) {
            return filer->filerStatus();
        }
        static_cast<void>(ring.addSegment(new ZyrGeSegment2d(start, end, bulge)));
    }
    return Hsys::eSuccess;
}
