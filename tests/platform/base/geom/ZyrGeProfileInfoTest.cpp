// Grouping the rings of a profile: outlines with their holes, holes with their islands.
#include "platform/base/geom/ZyrGeProfileInfo.h"
#include "platform/base/geom/ZyrGeProfile.h"

#include <gtest/gtest.h>

namespace {

ZyrGeRing* square(double x, double y, double size, bool clockWise) {
    const HsGePoint2d corners[] = {{x, y}, {x + size, y}, {x + size, y + size}, {x, y + size}};
    auto* ring = new ZyrGeRing;
    for (int index = 0; index < 4; ++index) {
        EXPECT_EQ(ring->addSegment(new ZyrGeSegment2d(corners[index], corners[(index + 1) % 4])),
                  Hsys::eSuccess);
    }
    if (clockWise) {
        ring->reverse();
    }
    return ring;
}

TEST(ZyrGeProfileInfo, holesGoToTheSmallestEnclosingOutline) {
    ZyrGeProfile profile;
    // Outline 0 holds hole 1, which holds island 2, which holds hole 3; outline 4 stands apart
    // and hole 5 lies in no outline.
    ASSERT_EQ(profile.addRing(square(0, 0, 100, false)), Hsys::eSuccess);
    ASSERT_EQ(profile.addRing(square(10, 10, 80, true)), Hsys::eSuccess);
    ASSERT_EQ(profile.addRing(square(20, 20, 60, false)), Hsys::eSuccess);
    ASSERT_EQ(profile.addRing(square(30, 30, 10, true)), Hsys::eSuccess);
    ASSERT_EQ(profile.addRing(square(200, 0, 10, false)), Hsys::eSuccess);
    ASSERT_EQ(profile.addRing(square(300, 0, 10, true)), Hsys::eSuccess);

    ZyrGeProfileInfo info;
    info.setProfile(&profile);
    info.buildNonVoidGroups();
    info.buildVoidGroups();
    const auto ringAt = [&profile](int index) { return profile.ring(index); };

    ASSERT_EQ(info.nonVoidGroups().size(), 3u);
    EXPECT_EQ(info.nonVoidGroups()[0].ring, ringAt(0));
    EXPECT_EQ(info.nonVoidGroups()[0].innerRings, std::vector<ZyrGeRing*>{ringAt(1)});
    EXPECT_EQ(info.nonVoidGroups()[1].innerRings, std::vector<ZyrGeRing*>{ringAt(3)});
    EXPECT_TRUE(info.nonVoidGroups()[2].innerRings.empty());

    ASSERT_EQ(info.voidGroups().size(), 3u);
    EXPECT_EQ(info.voidGroups()[0].innerRings, std::vector<ZyrGeRing*>{ringAt(2)});
    EXPECT_TRUE(info.voidGroups()[1].innerRings.empty());
    EXPECT_EQ(info.voidGroups()[2].ring, ringAt(5));

    info.setProfile(nullptr);
    EXPECT_TRUE(info.nonVoidGroups().empty());
    info.buildVoidGroups();
    EXPECT_TRUE(info.voidGroups().empty());
}

} // namespace
