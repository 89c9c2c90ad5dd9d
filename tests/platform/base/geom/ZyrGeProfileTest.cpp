// Profiles: the sample area, extents, scaling, transformation, copying, validity and filing, alone
// and nested in the object that holds them; and the grouping of their rings.
#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/geom/ZyrGeProfileInfo.h"
#include "platform/base/obj/ZyrDbGeo.h"
#include "platform/base/obj/ZyrFiling.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ge/HsGeMatrix3d.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <memory>
#include <numbers>
#include <random>
#include <utility>

namespace {

using testing::DoubleNear;
using testing::Pointwise;

// Taken while the test program starts, before any test made a profile: a drawing read first thing
// must find the class of the profiles nested in its areas by name.
const bool gProfileClassKnownAtLoad = hsrxFindHsRxClass(L"ZyrGeProfile") != nullptr;

TEST(ZyrGeProfile, isRegisteredWhenTheLibraryLoads) {
    EXPECT_TRUE(gProfileClassKnownAtLoad);
}

constexpr double kPi = std::numbers::pi;
// A rectangle of 10 by 8 with a three-quarter circle of radius 4 on a corner, less a triangle
// of base 7.5 and height 6.
constexpr double kOutlineArea = 80.0 + 12.0 * kPi;
constexpr double kSampleArea = kOutlineArea - 22.5;
const HsGeVector2d kSurvey(3'500'000.0, 5'400'000.0);

ZyrGeRing* ringOf(const std::vector<ZyrGeSegment2d>& segments) {
    auto* ring = new ZyrGeRing;
    for (const ZyrGeSegment2d& segment : segments) {
        EXPECT_EQ(ring->addSegment(new ZyrGeSegment2d(segment)), Hsys::eSuccess);
    }
    return ring;
}

ZyrGeRing* lineRing(const std::vector<HsGePoint2d>& corners) {
    std::vector<ZyrGeSegment2d> segments;
    for (size_t i = 0; i < corners.size(); ++i) {
        segments.emplace_back(corners[i], corners[(i + 1) % corners.size()]);
    }
    return ringOf(segments);
}

ZyrGeProfile profileOf(const std::vector<ZyrGeRing*>& rings) {
    ZyrGeProfile profile;
    for (ZyrGeRing* ring : rings) {
        EXPECT_EQ(profile.addRing(ring), Hsys::eSuccess);
    }
    return profile;
}

// The outline turns counter-clockwise and adds, the hole turns clockwise and subtracts.
ZyrGeProfile sampleProfile(const HsGeVector2d& offset = {}) {
    const auto at = [&offset](double x, double y) { return HsGePoint2d(x, y) + offset; };
    const ZyrGeSegment2d arc(new HsGeCircArc2d(at(6, -8), at(10, -12), at(10, -4)));
    return profileOf({ringOf({{at(0, 0), at(0, -8)},
                              {at(0, -8), at(6, -8)},
                              arc,
                              {at(10, -4), at(10, 0)},
                              {at(10, 0), at(0, 0)}}),
                      lineRing({at(1.7, -6.64), at(5.45, -0.64), at(9.2, -6.64)})});
}

TEST(ZyrGeProfile, sampleAreaIsExactNearAndFarFromTheOrigin) {
    for (const HsGeVector2d offset : {HsGeVector2d(), kSurvey}) {
        ZyrGeProfile profile = sampleProfile(offset);
        ASSERT_EQ(profile.ringCount(), 2);
        EXPECT_NEAR(profile.ring(0)->area(), kOutlineArea, 1e-9);
        EXPECT_NEAR(profile.ring(1)->area(), -22.5, 1e-9);
        EXPECT_NEAR(profile.area(0.0), kSampleArea, 1e-9);
        EXPECT_NEAR(profile.area(22.6), kOutlineArea, 1e-9) << "rings within the tolerance";
        EXPECT_NEAR(profile.ring(0)->length(), 10 + 4 + 6 * kPi + 6 + 8, 1e-9);
        EXPECT_TRUE(profile.isValidProfile(false));
        EXPECT_TRUE(profile.isValidProfile(true));
        EXPECT_EQ(profile.addRing(nullptr), Hsys::eNullPointer);
        EXPECT_EQ(profile.ringCount(), 2);
    }
}

TEST(ZyrGeProfile, jointsFarFromTheOriginAreNotTakenForCrossings) {
    // Turned rooms of 3 to 22 corners with some arcs: where coordinates carry 7 digits before the
    // point, a crossing of neighbours worked out in place misses their joint by a rounding.
    std::mt19937 random(1);
    const auto unit = [&random] { return static_cast<double>(random()) / random.max(); };
    int invalid = 0;
    for (int room = 0; room < 2000; ++room) {
        const size_t corners = 3 + room % 20;
        std::vector<HsGePoint2d> points;
        for (size_t i = 0; i < corners; ++i) {
            const double angle = 2.0 * kPi * static_cast<double>(i) / corners;
            const double radius = 5.0 + 3.0 * unit();
            points.emplace_back(3'500'000.123 + radius * std::cos(angle),
                                5'400'000.77 + radius * std::sin(angle));
        }
        std::vector<ZyrGeSegment2d> segments;
        for (size_t i = 0; i < corners; ++i) {
            segments.emplace_back(points[i], points[(i + 1) % corners], i % 3 ? 0.0 : 0.1 * unit());
        }
        ZyrGeProfile profile = profileOf({ringOf(segments)});
        profile.transformBy(
            HsGeMatrix3d::rotation(unit(), HsGeVector3d::kZAxis, {3'500'000.0, 5'400'000.0, 0.0}));
        invalid += profile.isValidProfile(true) ? 0 : 1;
    }
    EXPECT_EQ(invalid, 0);
}

TEST(ZyrGeProfile, extentsTakeInTheArcAndGoStaleOnEveryChange) {
    ZyrGeProfile profile = sampleProfile();
    const auto extents = [&profile] {
        EXPECT_TRUE(profile.isExtentsStale());
        profile.updateExtents();
        EXPECT_FALSE(profile.isExtentsStale());
        return std::vector{profile.left(), profile.bottom(), profile.right(), profile.top()};
    };
    EXPECT_THAT(extents(), Pointwise(DoubleNear(1e-12), {0.0, -12.0, 14.0, 0.0}));
    ASSERT_EQ(profile.setExtent(7.0, -24.0), Hsys::eSuccess);
    // Met within the point tolerance although the stretched arc stays circular.
    EXPECT_THAT(extents(), Pointwise(DoubleNear(1e-10), {0.0, -12.0, 7.0, 12.0}));
    EXPECT_TRUE(profile.isValidProfile(true));
    // Reading through the const ring leaves the rectangle fresh; the writable one may change it.
    static_cast<void>(std::as_const(profile).ring(0));
    EXPECT_FALSE(profile.isExtentsStale());
    static_cast<void>(profile.ring(0));
    EXPECT_TRUE(profile.isExtentsStale());
}

TEST(ZyrGeProfile, scaleAndSetExtentRefuseSizesThatCollapse) {
    ZyrGeProfile profile = sampleProfile();
    EXPECT_EQ(profile.scale(0.0, 1.0), Hsys::eInvalidInput);
    EXPECT_EQ(profile.scale(1.0, std::nan("")), Hsys::eInvalidInput);
    EXPECT_EQ(profile.setExtent(0.0, 1.0), Hsys::eInvalidInput);
    EXPECT_EQ(ZyrGeProfile().setExtent(2.0, 2.0), Hsys::eInvalidInput);
    EXPECT_NEAR(profile.area(0.0), kSampleArea, 1e-9);
    ASSERT_EQ(profile.scale(3.0, 3.0), Hsys::eSuccess);
    EXPECT_NEAR(profile.area(0.0), 9.0 * kSampleArea, 1e-8);
}

TEST(ZyrGeProfile, transformKeepsAreaAndRingSignsEvenWhenMirroring) {
    for (const HsGeMatrix3d& matrix :
         {HsGeMatrix3d::rotation(0.3, HsGeVector3d::kZAxis, {3'500'000.0, 0.0, 0.0}),
          HsGeMatrix3d::translation({-3'500'000.0, 5'400'000.0, 0.0}),
          HsGeMatrix3d::scaling(-1.0, 1.0, 1.0),
          HsGeMatrix3d::rotation(kPi, HsGeVector3d::kXAxis)}) {
        ZyrGeProfile profile = sampleProfile();
        profile.transformBy(matrix);
        EXPECT_NEAR(profile.ring(0)->area(), kOutlineArea, 1e-8);
        EXPECT_NEAR(profile.ring(1)->area(), -22.5, 1e-8);
        EXPECT_TRUE(profile.isValidProfile(true));
    }
}

TEST(ZyrGeProfile, copyFromIsDeepAndRefusesOtherClasses) {
    ZyrGeProfile source = sampleProfile();
    ZyrGeProfile copy;
    ASSERT_EQ(copy.copyFrom(&source), Hsys::eSuccess);
    source.ring(0)->reverse();
    source.removeAllRings();
    EXPECT_NEAR(copy.area(0.0), kSampleArea, 1e-9);
    HsRxObject plain;
    EXPECT_EQ(copy.copyFrom(&plain), Hsys::eBadArgument);
    ZyrImpGeo otherImplementation;
    EXPECT_EQ(copy.copyFrom(&otherImplementation), Hsys::eBadArgument);
    EXPECT_EQ(copy.ringCount(), 2);
    std::unique_ptr<HsRxObject> clone(copy.clone());
    ASSERT_NE(ZyrGeProfile::cast(clone.get()), nullptr);
    EXPECT_NEAR(ZyrGeProfile::cast(clone.get())->area(0.0), kSampleArea, 1e-9);
}

TEST(ZyrGeProfile, validityRefusesDegenerateAndCrossingRings) {
    const double nan = std::nan("");
    // clang-format off
    const struct {
        const char* name;
        std::vector<ZyrGeSegment2d> segments;
        bool valid, validWithoutCrossings;
    } cases[] = {
        {"square", {{{0, 0}, {1, 0}}, {{1, 0}, {1, 1}}, {{1, 1}, {0, 1}}, {{0, 1}, {0, 0}}}, true, true},
        {"circle of two arcs", {{{0, 0}, {2, 0}, 1.0}, {{2, 0}, {0, 0}, 1.0}}, true, true},
        {"open", {{{0, 0}, {1, 0}}, {{1, 0}, {1, 1}}, {{1, 1}, {0, 1}}}, false, false},
        {"back and forth", {{{0, 0}, {1, 0}}, {{1, 0}, {0, 0}}}, false, false},
        {"collinear", {{{0, 0}, {1, 0}}, {{1, 0}, {2, 0}}, {{2, 0}, {0, 0}}}, false, false},
        {"zero length", {{{0, 0}, {1, 0}}, {{1, 0}, {1, 0}}, {{1, 0}, {0, 1}}, {{0, 1}, {0, 0}}}, false, false},
        {"not finite", {{{0, 0}, {1, 0}}, {{1, 0}, {nan, 1}}, {{nan, 1}, {0, 0}}}, false, false},
        {"bow tie", {{{0, 0}, {2, 2}}, {{2, 2}, {2, 0}}, {{2, 0}, {0, 1}}, {{0, 1}, {0, 0}}}, true, false},
        {"arc bulging over an edge",
         {{{0, 0}, {4, 0}}, {{4, 0}, {4, 1}}, {{4, 1}, {0, 1}, -1.0}, {{0, 1}, {0, 0}}}, true, false},
        {"touching itself", {{{0, 0}, {2, 0}}, {{2, 0}, {1, 1}}, {{1, 1}, {2, 2}}, {{2, 2}, {0, 2}},
                             {{0, 2}, {1, 1}}, {{1, 1}, {0, 0}}}, true, false}};
    // clang-format on
    for (const auto& c : cases) {
        const ZyrGeProfile profile = profileOf({ringOf(c.segments)});
        EXPECT_EQ(profile.isValidProfile(false), c.valid) << c.name;
        EXPECT_EQ(profile.isValidProfile(true), c.validWithoutCrossings) << c.name;
    }
    EXPECT_TRUE(ZyrGeProfile().isValidProfile(true));
    // A hole running beyond the outline's arc crosses another ring.
    ZyrGeProfile profile = sampleProfile();
    ASSERT_EQ(profile.addRing(lineRing({{12, -9}, {12, -7}, {15, -8}})), Hsys::eSuccess);
    EXPECT_TRUE(profile.isValidProfile(false));
    EXPECT_FALSE(profile.isValidProfile(true));
}

std::vector<std::uint8_t> filed(const ZyrGeProfile& profile) {
    HsDbBdfFiler writer;
    EXPECT_EQ(profile.bdfOutFields(&writer), Hsys::eSuccess);
    return writer.bytes();
}

TEST(ZyrGeProfile, nestedRoundTripKeepsEveryBitAndTakesItsOwnerAsParent) {
    const ZyrGeProfile source = sampleProfile(kSurvey);
    HsDbBdfFiler writer;
    ASSERT_EQ(Zyr::writeObject(&writer, &source, 80), Hsys::eSuccess);
    ZyrImpGeo owner;
    ZyrImpObj* read = nullptr;
    HsDbBdfFiler reader(writer.bytes(), nullptr);
    ASSERT_EQ(Zyr::readObject(&reader, &owner, read, 80), Hsys::eSuccess);
    const std::unique_ptr<ZyrImpObj> held(read);
    const ZyrGeProfile* profile = ZyrGeProfile::cast(read);
    ASSERT_NE(profile, nullptr);
    EXPECT_EQ(profile->impParent(), &owner);
    EXPECT_EQ(reader.remaining(), 0u);
    EXPECT_EQ(filed(*profile), filed(source));
    EXPECT_EQ(profile->area(0.0), source.area(0.0));
}

TEST(ZyrGeProfile, filedBytesAreVersionCountsPointsAndBulges) {
    // The implementation base's version word, the profile's, one ring of one segment.
    std::vector<std::uint8_t> expected = {0x50, 0x00, 0x50, 0x00, 1, 0, 0, 0, 1, 0, 0, 0};
    for (const double value : {1.0, 2.0, 1.0, 2.0, -1.0}) {
        const auto* bytes = reinterpret_cast<const std::uint8_t*>(&value);
        expected.insert(expected.end(), bytes, bytes + sizeof value);
    }
    EXPECT_EQ(filed(profileOf({ringOf({{{1, 2}, {1, 2}, -1.0}})})), expected);
}

TEST(ZyrGeProfile, everyTruncationFailsAndLeavesTheProfileAsItWas) {
    const std::vector<std::uint8_t> bytes = filed(sampleProfile());
    for (size_t length = 0; length < bytes.size(); ++length) {
        ZyrGeProfile profile = profileOf({new ZyrGeRing});
        HsDbBdfFiler reader({bytes.begin(), bytes.begin() + static_cast<long>(length)}, nullptr);
        EXPECT_EQ(profile.bdfInFields(&reader), Hsys::eFilerError) << "length " << length;
        EXPECT_EQ(profile.ringCount(), 1) << "length " << length;
    }
}

TEST(ZyrGeProfile, readerRefusesNewerVersionsAndCountsBeyondTheBytes) {
    // clang-format off
    const struct {
        const char* name;
        std::vector<std::uint8_t> bytes;
        Hsys::ErrorStatus status;
    } cases[] = {
        {"base version 81", {0x51, 0x00, 0x50, 0x00, 0, 0, 0, 0}, Hsys::eNewerVersion},
        {"profile version 81", {0x50, 0x00, 0x51, 0x00, 0, 0, 0, 0}, Hsys::eNewerVersion},
        {"four billion rings", {0x50, 0x00, 0x50, 0x00, 0xff, 0xff, 0xff, 0xff}, Hsys::eFilerError},
        {"ring of more segments than bytes",
         {0x50, 0x00, 0x50, 0x00, 1, 0, 0, 0, 1, 0, 0, 0, 0, 0, 0}, Hsys::eFilerError},
        {"no rings", {0x50, 0x00, 0x50, 0x00, 0, 0, 0, 0}, Hsys::eSuccess},
        {"version 25 drops a bool", {0x19, 0x00, 1, 0x19, 0x00, 0, 0, 0, 0, 0}, Hsys::eSuccess},
        {"version 25 without its bool", {0x50, 0x00, 0x19, 0x00, 0, 0, 0, 0}, Hsys::eFilerError}};
    // clang-format on
    for (const auto& c : cases) {
        ZyrGeProfile profile = sampleProfile();
        HsDbBdfFiler reader(c.bytes, nullptr);
        EXPECT_EQ(profile.bdfInFields(&reader), c.status) << c.name;
        EXPECT_EQ(profile.ringCount(), c.status == Hsys::eSuccess ? 0 : 2) << c.name;
        if (c.status == Hsys::eNewerVersion) {
            EXPECT_EQ(reader.filerStatus(), Hsys::eSuccess) << c.name;
            EXPECT_EQ(profile.filedVersion(), 81) << c.name;
        }
    }
}

TEST(ZyrGeProfile, changesAskWriteAccessOfThePublicObjectAtTheTop) {
    HsDbDatabase database;
    auto* entity = new ZyrDbGeo;
    HsDbObjectId id;
    ASSERT_EQ(database.addHsDbObject(id, entity), Hsys::eSuccess);
    ZyrImpGeo holder;
    holder.setParent(static_cast<HsDbObject*>(entity));
    ZyrGeProfile profile = sampleProfile();
    profile.setParent(&holder);
    EXPECT_EQ(profile.dbParent(), entity);
    EXPECT_EQ(profile.database(), &database);
    ASSERT_EQ(entity->downgradeOpen(), Hsys::eSuccess);
    EXPECT_THROW(profile.transformBy(HsGeMatrix3d::translation({1, 0, 0})), HsAssertionViolation);
    EXPECT_THROW(static_cast<void>(profile.addRing(new ZyrGeRing)), HsAssertionViolation);
    EXPECT_THROW(profile.removeAllRings(), HsAssertionViolation);
    EXPECT_EQ(profile.ringCount(), 2);
    EXPECT_NEAR(profile.area(0.0), kSampleArea, 1e-9);
    ASSERT_EQ(entity->upgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(profile.scale(2.0, 2.0), Hsys::eSuccess);
    EXPECT_NEAR(profile.area(0.0), 4.0 * kSampleArea, 1e-9);
    entity->close();
}

TEST(ZyrGeProfileInfo, holesGoToTheSmallestEnclosingOutline) {
    const auto square = [](double x, double y, double size, bool clockWise) {
        ZyrGeRing* ring = lineRing({{x, y}, {x + size, y}, {x + size, y + size}, {x, y + size}});
        if (clockWise) {
            ring->reverse();
        }
        return ring;
    };
    // Outline 0 holds hole 1, which holds island 2, which holds hole 3; outline 4 stands apart
    // and hole 5 lies in no outline.
    ZyrGeProfile profile =
        profileOf({square(0, 0, 100, false), square(10, 10, 80, true), square(20, 20, 60, false),
                   square(30, 30, 10, true), square(200, 0, 10, false), square(300, 0, 10, true)});
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
