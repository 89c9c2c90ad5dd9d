// A drawing to play scenarios on: the module's classes registered through their decorators as the
// module's start does, its service up (it offers the calculation algorithms), and a database with
// the standard records and the module's dictionaries.
#pragma once

#include "tests/areacalc/module/ZyrAreaCalculationTestModule.h"

#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/modifiers/ZyrDbAreaModifier.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDbAreaGroupStyle.h"
#include "areacalc/objects/ZyrDbAreaStyle.h"
#include "areacalc/objects/ZyrDictAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictAreaModifiers.h"
#include "areacalc/objects/ZyrDictAreaStyle.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <initializer_list>
#include <memory>
#include <string>
#include <tuple>
#include <unistd.h>
#include <utility>
#include <vector>

using Ids = std::vector<HsDbObjectId>;
using Classes = std::vector<HsRxClass*>;

class ZyrAreaDrawing : public ::testing::Test {
public:
    static void SetUpTestSuite() {
        static int image; // stands for the handle the loader gives at attach
        _hdllInstance = &image;
        ZyrAreaCalculationBaseTexts::registerTexts();
        ZyrDecoratorManager::bindModule(_hdllInstance, ZyrAreaCalculationBaseApp::kAppName);
        ZyrDecoratorManager::registerClasses(_hdllInstance);
        ZyrAreaCalculationTestModule::services();
    }

    static HsRxClass* areaAlgorithm() { return ZyrAreaCalculationAreaAlgorithm::desc(); }
    static HsRxClass* perimeterAlgorithm() { return ZyrAreaCalculationPerimeterAlgorithm::desc(); }

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
        ASSERT_TRUE(ZyrDictAreaModifiers(&database).isValid(true, false));
        standardStyle = ZyrDictAreaStyle::getStandardAreaStyle(&database);
        ASSERT_FALSE(standardStyle.isNull());
    }

    HsDbObjectId add(HsDbObject* object) {
        HsDbObjectId id;
        EXPECT_EQ(database.addHsDbObject(id, object), Hsys::eSuccess);
        object->close();
        return id;
    }
    template <class Dictionary, class Record> HsDbObjectId addRecord(const wchar_t* name) {
        HsDbObjectId id;
        auto* record = new Record;
        EXPECT_EQ(Dictionary(&database).addNewRecord(name, record, id), Hsys::eSuccess);
        record->close();
        return id;
    }
    HsDbObjectId addAreaStyle(const wchar_t* name) {
        return addRecord<ZyrDictAreaStyle, ZyrDbAreaStyle>(name);
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
    // its handler in this order; every algorithm is allowed unless a list is given.
    HsDbObjectId addGroup(const wchar_t* name, const Ids& groups = {}, const Ids& areas = {},
                          const Classes* allowed = nullptr) {
        auto* group = new ZyrDbAreaGroup;
        EXPECT_EQ(group->setName(name), Hsys::eSuccess);
        const HsDbObjectId id = add(group);
        HsDbObjectPointer<ZyrDbAreaGroup> opened(id, HsDb::kForWrite);
        for (const HsDbObjectId& child : groups)
            EXPECT_EQ(opened->groupHandler()->addNode(child), Hsys::eSuccess);
        for (const HsDbObjectId& area : areas)
            EXPECT_EQ(opened->groupHandler()->addLeaf(area), Hsys::eSuccess);
        if (allowed != nullptr) {
            opened->algorithms().clear();
            for (HsRxClass* cls : *allowed)
                EXPECT_EQ(opened->algorithms().add(cls), Hsys::eSuccess);
        }
        return id;
    }
    // A modifier record of the drawing, acting on every algorithm.
    HsDbObjectId
    addModifier(const wchar_t* name, const wchar_t* formula,
                std::initializer_list<std::pair<const wchar_t*, double>> parameters = {}) {
        auto* modifier = new ZyrDbAreaModifier;
        EXPECT_EQ(modifier->setExpression(formula), Hsys::eSuccess);
        for (const auto& [parameter, value] : parameters)
            EXPECT_EQ(modifier->addParameter(parameter, value), Hsys::eSuccess);
        HsDbObjectId id;
        EXPECT_EQ(ZyrDictAreaModifiers(&database).addNewRecord(name, modifier, id), Hsys::eSuccess);
        modifier->close();
        return id;
    }
    static void erase(const HsDbObjectId& id) {
        EXPECT_EQ(HsDbObjectPointer<HsDbObject>(id, HsDb::kForWrite)->erase(), Hsys::eSuccess);
    }
    // The database read back from a drawing file it was saved to, and the way to its ids.
    std::unique_ptr<HsDbDatabase> reloaded() {
        const std::wstring file = (std::filesystem::temp_directory_path() /
                                   ("zyrarea-" + std::to_string(::getpid()) + ".drawing"))
                                      .wstring();
        EXPECT_EQ(database.saveAs(file.c_str()), Hsys::eSuccess);
        auto loaded = std::make_unique<HsDbDatabase>(HsDb::kEmptyDatabase);
        EXPECT_EQ(loaded->readDrawingFile(file.c_str()), Hsys::eSuccess);
        std::filesystem::remove(file);
        return loaded;
    }
    static Ids there(HsDbDatabase& loaded, const Ids& ids) {
        Ids found;
        for (const HsDbObjectId& id : ids)
            EXPECT_EQ(loaded.getHsDbObjectId(found.emplace_back(), false, id.handle()),
                      Hsys::eSuccess);
        return found;
    }

    HsDbDatabase database;
    HsDbObjectId standardStyle;
};
