// Reduces a ring with arc edges to a polygon of chords and the circular segments beside it.
#include "platform/base/geom/ZyrRingPreparator.h"

#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/zyrtl/zyrtlDelete.h"
#include "platform/host/ge/HsGeCircArc2d.h"

#include <memory>
#include <utility>

ZyrRingPreparator::ZyrRingPreparator(const ZyrGeRing* ring) : m_ring(ring) {}

ZyrRingPreparator::~ZyrRingPreparator() {
    deleteArcs();
}

void ZyrRingPreparator::prepare() {
    deleteArcs();
    m_vertices.clear();
    if (m_ring == nullptr || m_ring->segmentCount() == 0) {
        return;
    }
    for (int index = 0; index < m_ring->segmentCount(); ++index) {
        const ZyrGeSegment2d& segment = *m_ring->segment(index);
        m_vertices.push_back(segment.startPoint());
        auto arc = std::make_unique<HsGeCircArc2d>();
        if (segment.getArc(*arc)) {
            (segment.bulge() > 0.0 ? m_positiveArcs : m_negativeArcs).push_back(arc.release());
        }
    }
    m_vertices.push_back(m_vertices.front());
}

std::vector<HsGeCircArc2d*> ZyrRingPreparator::positiveArcs() {
    return std::exchange(m_positiveArcs, {});
}

std::vector<HsGeCircArc2d*> ZyrRingPreparator::negativeArcs() {
    return std::exchange(m_negativeArcs, {});
}

void ZyrRingPreparator::deleteArcs() {
    zyrtl::deleteItems(m_positiveArcs);
    zyrtl::deleteItems(m_negativeArcs);
}
