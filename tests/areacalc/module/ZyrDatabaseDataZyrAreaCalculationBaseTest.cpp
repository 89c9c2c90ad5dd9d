// The module's per-database packet: one per drawing, the working drawing standing in for null,
// and dynamic properties enabled until turned off.
#include "areacalc/module/ZyrDatabaseDataZyrAreaCalculationBase.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include <gtest/gtest.h>

namespace {

using Packet = ZyrDatabaseDataZyrAreaCalculationBase;

TEST(ZyrDatabaseDataZyrAreaCalculationBase, eachDrawingHasOnePacketAndNullMeansTheWorkingOne) {
    ZyrAreaCalculationTestModule::registerClasses();
    HsDbDatabase working;
    HsDbDatabase other;
    hsdbHostApplicationServices()->setWorkingDatabase(&working);
    EXPECT_EQ(Packet::instance(&working), nullptr) << "no service, no packets";

    ZyrAreaCalculationTestModule::services();
    Packet* packet = Packet::instance(nullptr);
    ASSERT_NE(packet, nullptr);
    EXPECT_EQ(packet->database(), &working);
    EXPECT_EQ(Packet::instance(&working), packet);
    EXPECT_NE(Packet::instance(&other), packet);
    hsdbHostApplicationServices()->setWorkingDatabase(&other);
    EXPECT_EQ(Packet::instance(nullptr), Packet::instance(&other));
    hsdbHostApplicationServices()->setWorkingDatabase(nullptr);
}

TEST(ZyrDatabaseDataZyrAreaCalculationBase, dynamicPropertiesAreEnabledUntilTurnedOff) {
    Packet packet;
    // Each step sets a key, then keys 5 and 7 read as given.
    const struct {
        int key;
        bool value;
        bool five;
        bool seven;
    } steps[] = {{5, false, false, true}, {7, false, false, false}, {5, true, true, false}};
    EXPECT_TRUE(packet.dynPropEnableValue(5));
    for (const auto& step : steps) {
        packet.dynPropEnableValue(step.key, step.value);
        EXPECT_EQ(packet.dynPropEnableValue(5), step.five);
        EXPECT_EQ(packet.dynPropEnableValue(7), step.seven);
    }
}

} // namespace
