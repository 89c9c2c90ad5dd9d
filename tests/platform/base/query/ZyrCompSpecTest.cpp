// Component descriptions: the locations of an object's property sets, and the schedule service's
// registries of query classes and component descriptions.
#include "platform/base/query/ZyrCompSpec.h"
#include "platform/base/query/ZyrScheduleDataServices.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxDynamicLinker.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "tests/platform/base/dict/ZyrDictTestRecords.h"

#include <gtest/gtest.h>

namespace {

// Property sets of a styled entity lie on the entity or on its style.
class StyledEntitySpec : public ZyrCompSpec {
    HSRX_DECLARE_MEMBERS(StyledEntitySpec)

public:
    HsRxClass* worksWith() const override { return ZyrTestStyledEntity::desc(); }
    Hsys::ErrorStatus propSetLocations(HsDbObject* object, HsArray<HsDbObjectId>& ids,
                                       ZyrRmCStringArray& names) override {
        const Hsys::ErrorStatus status = ZyrCompSpec::propSetLocations(object, ids, names);
        const auto* entity = ZyrTestStyledEntity::cast(object);
        return entity != nullptr ? addLocation(entity->styleId(), ids, names) : status;
    }
};
HSRX_DEFINE_MEMBERS(StyledEntitySpec, ZyrCompSpec, 0, hsrxInstantiateClass<StyledEntitySpec>)

TEST(ZyrCompSpec, locationsAreTheObjectThenItsStyleEachOnceAndFoundThroughTheFactory) {
    HsDbDatabase db;
    ZyrTestStyleDict styles(&db);
    ASSERT_TRUE(styles.isValid(true, true));
    const HsDbObjectId standard = styles.standardRecord();
    const HsDbObjectId entityId = addStyledEntity(db, standard);
    ZyrCompSpecFactory factory;
    EXPECT_EQ(factory.registerCompSpec(ZyrCompSpec::desc()), Hsys::eWrongClass); // makes none
    EXPECT_EQ(factory.registerCompSpec(ZyrTestStyle::desc()), Hsys::eWrongClass);
    ASSERT_EQ(factory.registerCompSpec(StyledEntitySpec::desc()), Hsys::eSuccess);
    EXPECT_EQ(factory.registerCompSpec(StyledEntitySpec::desc()), Hsys::eAlreadyPresent);

    HsDbObjectPointer<ZyrTestStyledEntity> entity(entityId, HsDb::kForRead);
    HsDbObjectPointer<ZyrDbDictRecord> style(standard, HsDb::kForRead);
    ZyrCompSpec* compSpec = factory.compSpecFor(entity.object());
    ASSERT_NE(compSpec, nullptr);
    EXPECT_EQ(factory.compSpecFor(style.object()), nullptr);
    HsArray<HsDbObjectId> ids;
    ZyrRmCStringArray names;
    EXPECT_EQ(compSpec->propSetLocations(entity.object(), ids, names), Hsys::eSuccess);
    EXPECT_EQ(compSpec->propSetLocations(entity.object(), ids, names), Hsys::eAlreadyPresent);
    EXPECT_EQ(ids, (HsArray<HsDbObjectId>{entityId, standard}));
    EXPECT_EQ(names, (ZyrRmCStringArray{L"ZyrTestStyledEntity", L"Standard"}));
    HsArray<HsDbObjectId> styleIds; // another class stops after the base's location
    EXPECT_EQ(compSpec->propSetLocations(style.object(), styleIds, names), Hsys::eSuccess);
    EXPECT_EQ(styleIds, HsArray<HsDbObjectId>{standard});

    EXPECT_EQ(ZyrCompSpec::addLocation(HsDbObjectId(), ids, names), Hsys::eNullId);
    const HsDbObjectId gone = styles.add(L"Gone");
    HsDbObjectPointer<ZyrDbDictRecord>(gone, HsDb::kForWrite)->erase();
    EXPECT_EQ(ZyrCompSpec::addLocation(gone, ids, names), Hsys::eWasErased);
    EXPECT_EQ(ids.length(), 2);
    EXPECT_EQ(factory.unRegisterCompSpec(StyledEntitySpec::desc()), Hsys::eSuccess);
    EXPECT_EQ(factory.unRegisterCompSpec(StyledEntitySpec::desc()), Hsys::eNameNotFound);
    EXPECT_EQ(factory.compSpecFor(entity.object()), nullptr);
}

TEST(ZyrScheduleDataServices, serviceIsWhatTheHostEnteredAndItsRegistriesKeepOrder) {
    EXPECT_EQ(ZyrScheduleDataServices::service(), nullptr);
    ZyrScheduleDataServices schedules;
    auto* linker = HsRxDynamicLinker::cast(hsrxSysRegistry()->at(kHsRxDynamicLinker));
    ASSERT_EQ(linker->registerService(ZyrScheduleDataServices::kServiceName, &schedules),
              Hsys::eSuccess);
    ASSERT_EQ(ZyrScheduleDataServices::service(), &schedules);
    ZyrQueryFactory* queries = schedules.queryFactory();
    EXPECT_EQ(queries->registerQuery(ZyrTestStyle::desc()), Hsys::eSuccess);
    EXPECT_EQ(queries->registerQuery(ZyrTestLabel::desc()), Hsys::eSuccess);
    EXPECT_EQ(queries->registerQuery(ZyrTestStyle::desc()), Hsys::eAlreadyPresent);
    EXPECT_EQ(queries->registerQuery(nullptr), Hsys::eNullPointer);
    EXPECT_EQ(queries->unRegisterQuery(ZyrTestStyle::desc()), Hsys::eSuccess);
    EXPECT_EQ(queries->unRegisterQuery(ZyrTestStyle::desc()), Hsys::eNameNotFound);
    EXPECT_EQ(queries->queryClasses(), std::vector<HsRxClass*>{ZyrTestLabel::desc()});
    linker->unregisterService(ZyrScheduleDataServices::kServiceName);
    EXPECT_EQ(ZyrScheduleDataServices::service(), nullptr);
}

} // namespace
