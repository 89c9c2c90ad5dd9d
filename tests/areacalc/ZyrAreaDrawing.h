// A drawing to play scenarios on: the module's classes registered through their decorators as the
// module's start does, and a database with the standard records and the module's dictionaries.
#pragma once

#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/module/ZyrAreaCalculationBaseModule.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDbAreaGroupStyle.h"
#include "areacalc/objects/ZyrDbAreaStyle.h"
#include "areacalc/objects/ZyrDictAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictAreaStyle.h"
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"

#include <gtest/gtest.h>

#include <initializer_list>

class ZyrAreaDrawing : public ::testing::Test {
public:
    static void SetUpTestSuite() {
        static int image; // stands for the handle the loader gives at attach
        _hdllInstance = &image;
        ZyrAreaCalculationBaseTexts::registerTexts();
        ZyrDecoratorManager::bindModule(_hdllInstance, ZyrAreaCalculationBaseApp::kAppName);
        ZyrDecoratorManager::registerClasses(_hdllInstance);
    }

    // A profile of rings, each of straight sides through its corners, closed back to the first.
    static ZyrGeProfile*
    profileOf(std::initializer_list<std::initializer_list<HsGePoint2d>> rings) {
        auto* profile = new ZyrGeProfile;
        for (const auto& corners : rings) {
            auto* ring = new ZyrGeRing;
            for (const HsGePoint2d* corner = corners.begin(); corner != corners.end(); ++corner) {
                const HsGePoint2d& next =
                    corner + 1 != corners.end() ? corner[1] : *corners.begin();
                EXPECT_EQ(ring->addSegment(new ZyrGeSegment2d(*corner, next)), Hsys::eSuccess);
            }
            EXPECT_EQ(profile->addRing(ring), Hsys::eSuccess);
        }
        return profile;
    }
    static ZyrGeProfile* rectangle(double width, double height) {
        return profileOf({{{0, 0}, {width, 0}, {width, height}, {0, height}}});
    }

protected:
    void SetUp() override {
        ASSERT_TRUE(ZyrDictAreaStyle(&database).isValid(true, true));
        ASSERT_TRUE(ZyrDictAreaGroupStyle(&database).isValid(true, true));
        standardStyle = ZyrDictAreaStyle::getStandardAreaStyle(&database);
        ASSERT_FALSE(standardStyle.isNull());
    }

    HsDbObjectId add(HsDbObject* object) {
        HsDbObjectId id;
        EXPECT_EQ(database.addHsDbObject(id, object), Hsys::eSuccess);
        object->close();
        return id;
    }
    HsDbObjectId addAreaStyle(const wchar_t* name) {
        HsDbObjectId id;
        auto* style = new ZyrDbAreaStyle;
        EXPECT_EQ(ZyrDictAreaStyle(&database).addNewRecord(name, style, id), Hsys::eSuccess);
        style->close();
        return id;
    }
    // An area of the drawing; the standard style unless one is given.
    HsDbObjectId addArea(const wchar_t* name, ZyrGeProfile* profile,
                         const HsDbObjectId& style = HsDbObjectId::kNull) {
        auto* area = new ZyrDbArea;
        EXPECT_EQ(area->setName(name), Hsys::eSuccess);
        EXPECT_EQ(area->setProfile(profile), Hsys::eSuccess);
        if (!style.isNull()) {
            EXPECT_EQ(area->setStyleId(style), Hsys::eSuccess);
        }
        return add(area);
    }

    // A group of the drawing holding the given groups and then the given areas, each added through
    // its handler in this order.
    HsDbObjectId addGroup(const wchar_t* name, std::initializer_list<HsDbObjectId> groups = {},
                          std::initializer_list<HsDbObjectId> areas = {}) {
        auto* group = new ZyrDbAreaGroup;
        EXPECT_EQ(group->setName(name), Hsys::eSuccess);
        const HsDbObjectId id = add(group);
        HsDbObjectPointer<ZyrDbAreaGroup> opened(id, HsDb::kForWrite);
        for (const HsDbObjectId& child : groups) {
            EXPECT_EQ(opened->groupHandler()->addNode(child), Hsys::eSuccess);
        }
        for (const HsDbObjectId& area : areas) {
            EXPECT_EQ(opened->groupHandler()->addLeaf(area), Hsys::eSuccess);
        }
        return id;
    }
    static void erase(const HsDbObjectId& id) {
        EXPECT_EQ(HsDbObjectPointer<HsDbObject>(id, HsDb::kForWrite)->erase(), Hsys::eSuccess);
    }

    HsDbDatabase database;
    HsDbObjectId standardStyle;
};
