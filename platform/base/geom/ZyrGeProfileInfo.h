// Groups the rings of a profile: each outline with the rings directly inside it.
#pragma once

#include <vector>

class ZyrGeProfile;
class ZyrGeRing;

class ZyrGeProfileInfo {
public:
    // A ring and the rings of the other sign that lie directly inside it: the holes of an
    // outline, or the islands of a hole. None of the rings is owned.
    struct Group {
        ZyrGeRing* ring = nullptr;
        std::vector<ZyrGeRing*> innerRings;
    };

    // Forgets the groups of the previous profile. The profile stays the caller's and must outlive
    // the groups.
    void setProfile(ZyrGeProfile* profile);
    ZyrGeProfile* profile() const { return m_profile; }
    // One group for each ring of area not less than 0, with the holes directly inside it.
    void buildNonVoidGroups();
    // One group for each ring of area less than 0, with the islands directly inside it.
    void buildVoidGroups();
    const std::vector<Group>& nonVoidGroups() const { return m_nonVoidGroups; }
    const std::vector<Group>& voidGroups() const { return m_voidGroups; }

private:
    std::vector<Group> buildGroups(bool voidRings) const;

    ZyrGeProfile* m_profile = nullptr;
    std::vector<Group> m_nonVoidGroups;
    std::vector<Group> m_voidGroups;
};
