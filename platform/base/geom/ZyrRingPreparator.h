// Reduces a ring with arc edges to a polygon of chords and the circular segments beside it.
#pragma once

#include "platform/host/ge/HsGePoint2d.h"

#include <vector>

class HsGeCircArc2d;
class ZyrGeRing;

class ZyrRingPreparator {
public:
    // The ring stays the caller's and must outlive prepare().
    explicit ZyrRingPreparator(const ZyrGeRing* ring);
    // Deletes the arcs that nobody took.
    ~ZyrRingPreparator();
    ZyrRingPreparator(const ZyrRingPreparator&) = delete;
    ZyrRingPreparator& operator=(const ZyrRingPreparator&) = delete;

    // Fills the vertices and arcs anew; a null ring gives none.
    void prepare();
    // The start point of every segment in ring order, and the first once more at the end, so
    // that the list is closed: its last point is not a vertex of its own.
    const std::vector<HsGePoint2d>& verticies() const { return m_vertices; }
    // The circular segments that add to the polygon's signed area (counter-clockwise arcs) and
    // those that subtract from it (clockwise arcs): polygon area plus the first minus the second
    // is the ring's area. Ownership passes to the caller, and a second call answers no arcs.
    std::vector<HsGeCircArc2d*> positiveArcs();
    std::vector<HsGeCircArc2d*> negativeArcs();

private:
    void deleteArcs();

    const ZyrGeRing* m_ring;
    std::vector<HsGePoint2d> m_vertices;
    std::vector<HsGeCircArc2d*> m_positiveArcs;
    std::vector<HsGeCircArc2d*> m_negativeArcs;
};
