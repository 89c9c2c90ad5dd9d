// The entity pair: overrides owned and filed with the entity through a drawing file, the ECS of
// geometric entities, the defaults of the entity bases, copies and audits.
#include "tests/platform/base/obj/ZyrSampleObjects.h"

#include "platform/base/obj/ZyrScaleInfo.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"
#include "platform/host/ge/HsGePlane.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>

namespace {

class ZyrDbEntityPair : public ::testing::Test {
protected:
    HsDbObjectId add(HsDbObject* object) { return addClosed(database, object); }

    // A shape with a translated ECS, members, a 2 by 2 square profile and the records' override.
    HsDbObjectId addShape(const std::vector<HsDbObjectId>& records,
                          const std::vector<HsDbObjectId>& members = {}) {
        ZyrDbSampleShape* shape = newSampleShape(members, records);
        EXPECT_EQ(shape->setEcs(HsGeMatrix3d::translation({5, 6, 0})), Hsys::eSuccess);
        auto* ring = new ZyrGeRing;
        const HsGePoint2d corners[] = {{0, 0}, {2, 0}, {2, 2}, {0, 2}};
        for (int i = 0; i < 4; ++i)
            EXPECT_EQ(ring->addSegment(new ZyrGeSegment2d(corners[i], corners[(i + 1) % 4], 0.0)),
                      Hsys::eSuccess);
        auto* square = new ZyrGeProfile;
        EXPECT_EQ(square->addRing(ring), Hsys::eSuccess);
        shape->shapeImp()->setProfile(square);
        return add(shape);
    }

    HsDbDatabase database;
};

TEST_F(ZyrDbEntityPair, overridesAreOwnedInOrderAndRefuseTwins) {
    ZyrDbSampleShape shape;
    auto* first = new ZyrSampleOverride;
    auto* second = new ZyrSampleOverride;
    EXPECT_EQ(shape.appendOverride(first), Hsys::eSuccess);
    EXPECT_EQ(shape.appendOverride(second), Hsys::eSuccess);
    EXPECT_EQ(shape.appendOverride(first), Hsys::eAlreadyPresent);
    EXPECT_EQ(shape.appendOverride(nullptr), Hsys::eNullPointer);
    EXPECT_EQ(first->dbParent(), &shape);
    EXPECT_EQ(shape.getOverrideAt(2), nullptr);
    EXPECT_EQ(shape.getOverrideAt(-1), nullptr);
    EXPECT_EQ(shape.deleteOverrideAt(2), Hsys::eInvalidIndex);
    EXPECT_EQ(shape.deleteOverrideAt(0), Hsys::eSuccess);
    ASSERT_EQ(shape.overrideCount(), 1);
    EXPECT_EQ(shape.getOverrideAt(0), second);
}

TEST_F(ZyrDbEntityPair, everythingSurvivesADrawingFileSaveAndLoad) {
    const HsDbObjectId a = add(new ZyrDbSampleRecord);
    const HsDbObjectId b = add(new ZyrDbSampleRecord);
    const HsDbObjectId member = add(new ZyrDbSampleShape);
    const HsDbObjectId id = addShape({a, b, a}, {member});
    const ZyrScratchDrawing drawing;
    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    ASSERT_EQ(loaded.readDrawingFile(drawing.savedFrom(database).c_str()), Hsys::eSuccess);
    HsDbObjectId loadedId;
    ASSERT_EQ(loaded.getHsDbObjectId(loadedId, false, id.handle()), Hsys::eSuccess);
    HsDbObjectPointer<ZyrDbSampleShape> shape(loadedId, HsDb::kForRead);
    ASSERT_TRUE(shape) << Hsys::toString(shape.openStatus());
    ASSERT_EQ(shape->overrideCount(), 1);
    const ZyrSampleOverride* override = ZyrSampleOverride::cast(shape->getOverrideAt(0));
    ASSERT_NE(override, nullptr);
    std::vector<std::uint64_t> handles;
    for (const HsDbObjectId& record : override->records())
        handles.push_back(record.handle());
    EXPECT_EQ(handles, (std::vector<std::uint64_t>{a.handle(), b.handle(), a.handle()}));
    EXPECT_EQ(override->dbParent(), shape.object());
    EXPECT_TRUE(shape->ecs().isEqualTo(HsGeMatrix3d::translation({5, 6, 0})));
    ASSERT_EQ(shape->shapeImp()->members().size(), 1u);
    EXPECT_EQ(shape->shapeImp()->members()[0].handle(), member.handle());
    ASSERT_NE(shape->shapeImp()->profile(), nullptr);
    EXPECT_NEAR(shape->shapeImp()->profile()->area(0.0), 4.0, 1e-12);
    EXPECT_EQ(shape->shapeImp()->profile()->dbParent(), shape.object());
}

TEST_F(ZyrDbEntityPair, aNestedClassThisBuildDoesNotKnowRefusesTheEntityAsOfALaterVersion) {
    const HsDbObjectId id = addShape({add(new ZyrDbSampleRecord)});
    HsDbBdfFiler writer(&database);
    {
        HsDbObjectPointer<ZyrDbSampleShape> shape(id, HsDb::kForRead);
        ASSERT_EQ(shape->bdfOut(&writer), Hsys::eSuccess);
    }
    // The override's class name, as the filer lays out its characters, last letter changed.
    std::vector<std::uint8_t> bytes = writer.bytes();
    std::vector<std::uint8_t> name;
    for (const wchar_t c : std::wstring(L"ZyrSampleOverride"))
        name.insert(name.end(), {static_cast<std::uint8_t>(c), 0, 0, 0});
    const auto at = std::search(bytes.begin(), bytes.end(), name.begin(), name.end());
    ASSERT_NE(at, bytes.end());
    *(at + long(name.size()) - 4) = 'f';
    HsDbBdfFiler reader(bytes, &database);
    ZyrDbSampleShape fresh;
    EXPECT_EQ(fresh.bdfIn(&reader), Hsys::eNewerVersion) << "the host keeps it as a proxy";
    EXPECT_EQ(fresh.overrideCount(), 0);
}

TEST_F(ZyrDbEntityPair, copyClonesOverridesAndTheImplementation) {
    const HsDbObjectId record = add(new ZyrDbSampleRecord);
    const HsDbObjectId id = addShape({record});
    HsDbObjectPointer<ZyrDbSampleShape> source(id, HsDb::kForRead);
    ZyrDbSampleShape copy;
    ASSERT_EQ(copy.copyFrom(source.object()), Hsys::eSuccess);
    ASSERT_EQ(copy.overrideCount(), 1);
    EXPECT_NE(copy.getOverrideAt(0), source->getOverrideAt(0));
    EXPECT_EQ(copy.getOverrideAt(0)->dbParent(), &copy);
    EXPECT_EQ(ZyrSampleOverride::cast(copy.getOverrideAt(0))->records(),
              std::vector<HsDbObjectId>{record});
    EXPECT_TRUE(copy.ecs().isEqualTo(source->ecs()));
    ZyrDbSampleRecord notAnEntity;
    EXPECT_EQ(copy.copyFrom(&notAnEntity), Hsys::eBadArgument);
    EXPECT_EQ(copy.overrideCount(), 1);
}

TEST_F(ZyrDbEntityPair, auditOfOverridesCountsAndRemovesBadRecords) {
    const HsDbObjectId good = add(new ZyrDbSampleRecord);
    const HsDbObjectId erased = add(new ZyrDbSampleRecord);
    const HsDbObjectId wrongClass = add(new ZyrDbSampleShape);
    const HsDbObjectId id = addShape({erased, good, wrongClass});
    ASSERT_EQ(HsDbObjectPointer<ZyrDbSampleRecord>(erased, HsDb::kForWrite)->erase(),
              Hsys::eSuccess);
    HsDbAuditInfo check(false);
    EXPECT_EQ(HsDbObjectPointer<ZyrDbSampleShape>(id, HsDb::kForRead)->audit(&check),
              Hsys::eAuditErrorsNotFixed);
    EXPECT_EQ(check.numErrors(), 2);
    HsDbAuditInfo fix(true);
    HsDbObjectPointer<ZyrDbSampleShape> shape(id, HsDb::kForWrite);
    EXPECT_EQ(shape->audit(&fix), Hsys::eAuditFixedErrors);
    EXPECT_EQ(fix.numFixes(), 2);
    EXPECT_EQ(ZyrSampleOverride::cast(shape->getOverrideAt(0))->records(),
              std::vector<HsDbObjectId>{good});
}

TEST_F(ZyrDbEntityPair, ecsRefusesMatricesThatCannotPlaceAnObjectAndScalesMustBeValid) {
    ZyrDbSampleShape shape;
    HsGeMatrix3d flat = HsGeMatrix3d::scaling(1.0, 1.0, 0.0);
    HsGeMatrix3d notFinite;
    notFinite(0, 3) = std::numeric_limits<double>::infinity();
    EXPECT_EQ(shape.setEcs(flat), Hsys::eBadArgument);
    EXPECT_EQ(shape.setEcs(notFinite), Hsys::eBadArgument);
    EXPECT_TRUE(shape.ecs().isEqualTo(HsGeMatrix3d::kIdentity));
    EXPECT_EQ(shape.setEcs(flat, false), Hsys::eSuccess) << "unvalidated, as a copy sets it";
    EXPECT_EQ(shape.imp()->scaleBy(ZyrScaleInfo{2.0, 0.0, 1.0}), Hsys::eBadArgument);
    EXPECT_EQ(shape.imp()->scaleBy(ZyrScaleInfo{-2.0, 3.0, 1.0}), Hsys::eSuccess);
}

TEST(ZyrImpGeo, boundBlockDimsAreTheLengthsOfItsSignedAxes) {
    const struct {
        HsGeBoundBlock3d block;
        double x, y, z;
    } cases[] = {
        {HsGeBoundBlock3d({0, 0, 0}, {2, 0, 0}, {0, 3, 0}, {0, 0, 4}), 2, 3, 4},
        {HsGeBoundBlock3d({0, 0, 0}, {-2, 0, 0}, {0, 3, 0}, {0, 0, -1}), -2, 3, -1},
        {HsGeBoundBlock3d({0, 0, 0}, {3, 4, 0}, {-4, 3, 0}, {0, 0, 1}), 5, 5, 1},
    };
    for (const auto& c : cases) {
        double x = 0, y = 0, z = 0;
        Zyr::boundBlockToDims(c.block, x, y, z);
        EXPECT_NEAR(x, c.x, 1e-12);
        EXPECT_NEAR(y, c.y, 1e-12);
        EXPECT_NEAR(z, c.z, 1e-12);
    }
}

} // namespace
