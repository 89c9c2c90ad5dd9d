// Groups the rings of a profile: each outline with the rings directly inside it.
#include "platform/base/geom/ZyrGeProfileInfo.h"

#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/geom/ZyrGeRing.h"

#include <cmath>

namespace {

bool isVoid(const ZyrGeRing& ring) {
    return ring.area() < 0.0;
}

// Whether inner lies within outer, judged by inner's first vertex.
bool encloses(const ZyrGeRing& outer, const ZyrGeRing& inner) {
    return inner.segmentCount() > 0 && outer.contains(inner.segment(0)->startPoint()) &&
           std::abs(inner.area()) < std::abs(outer.area());
}

} // namespace

void ZyrGeProfileInfo::setProfile(ZyrGeProfile* profile) {
    m_profile = profile;
    m_nonVoidGroups.clear();
    m_voidGroups.clear();
}

void ZyrGeProfileInfo::buildNonVoidGroups() {
    m_nonVoidGroups = buildGroups(false);
}

void ZyrGeProfileInfo::buildVoidGroups() {
    m_voidGroups = buildGroups(true);
}

std::vector<ZyrGeProfileInfo::Group> ZyrGeProfileInfo::buildGroups(bool voidRings) const {
    std::vector<Group> groups;
    if (m_profile == nullptr) {
        return groups;
    }
    std::vector<ZyrGeRing*> others;
    for (int index = 0; index < m_profile->ringCount(); ++index) {
        ZyrGeRing* ring = m_profile->ring(index);
        if (isVoid(*ring) == voidRings) {
            groups.push_back({ring, {}});
        } else {
            others.push_back(ring);
        }
    }
    // Each ring of the other sign goes to the smallest of the enclosing rings: with an island in
    // a hole in an outline, the island belongs to the hole and the hole to the outline.
    for (ZyrGeRing* other : others) {
        Group* smallest = nullptr;
        for (Group& group : groups) {
            if (encloses(*group.ring, *other) &&
                (smallest == nullptr ||
                 std::abs(group.ring->area()) < std::abs(smallest->ring->area()))) {
                smallest = &group;
            }
        }
        if (smallest != nullptr) {
            smallest->innerRings.push_back(other);
        }
    }
    return groups;
}
