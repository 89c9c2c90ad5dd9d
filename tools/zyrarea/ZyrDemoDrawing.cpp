#include "tools/zyrarea/ZyrDemoDrawing.h"

#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "areacalc/modifiers/ZyrDbAreaModifier.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDictAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictAreaModifiers.h"
#include "areacalc/objects/ZyrDictAreaStyle.h"
#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/geom/ZyrGeSegment2d.h"
#include "platform/host/db/HsDbDatabase.h"

#include <memory>
#include <vector>

namespace {

using Ids = std::vector<HsDbObjectId>;

enum Floor { kGroundFloor, kUpperFloor, kAttic, kFloorCount };

// How much of a room's area counts: in full, or through one of the drawing's modifier records.
enum Counting { kSlopingRoof, kBalconyShare, kCountingModifiers, kInFull = kCountingModifiers };

// A modifier record of the plan. Both act on the area alone: perimeters are measured in full.
struct Modifier {
    const wchar_t* name;
    const wchar_t* formula;
    // Null for a formula without a named parameter.
    const wchar_t* parameterName;
    double parameterValue;
};

constexpr Modifier kModifiers[kCountingModifiers] = {
    {L"Sloping roof", L"_AREA_VALUE_ * 0.5", nullptr, 0.0},
    {L"Balcony share", L"_AREA_VALUE_ * share", L"share", 0.25},
};

// A room of the plan: its name, its rectangle's sides in metres, its floor, and how its area
// counts.
struct Room {
    const wchar_t* name;
    double width;
    double depth;
    Floor floor;
    Counting counting;
};

// Area and perimeter are width times depth and twice their sum: Kitchen 20 m² and 18 m. The attic
// room lies under the sloping roof and counts half, 10 m²; a quarter of the balcony counts, 1.5 m².
constexpr Room kRooms[] = {
    {L"Kitchen", 4.0, 5.0, kGroundFloor, kInFull},
    {L"Living room", 6.0, 5.0, kGroundFloor, kInFull},
    {L"Hall", 2.0, 5.0, kGroundFloor, kInFull},
    {L"Bedroom", 4.0, 4.0, kUpperFloor, kInFull},
    {L"Bath", 2.5, 2.0, kUpperFloor, kInFull},
    {L"Balcony", 4.0, 1.5, kUpperFloor, kBalconyShare},
    {L"Attic room", 4.0, 5.0, kAttic, kSlopingRoof},
};
constexpr const wchar_t* kFloorNames[kFloorCount] = {L"Ground floor", L"Upper floor", L"Attic"};
constexpr const wchar_t* kHouseName = L"House";
// The style preview's sample area stands beside the house: a room with a curved wall and a shaft.
constexpr const wchar_t* kSampleName = L"Sample area";

ZyrGeProfile* rectangle(double width, double depth) {
    const HsGePoint2d corners[] = {{0, 0}, {width, 0}, {width, depth}, {0, depth}};
    auto ring = std::make_unique<ZyrGeRing>();
    for (int i = 0; i < 4; ++i)
        (void)ring->addSegment(new ZyrGeSegment2d(corners[i], corners[(i + 1) % 4]));
    auto profile = std::make_unique<ZyrGeProfile>();
    if (profile->addRing(ring.get()) != Hsys::eSuccess)
        return nullptr;
    ring.release();
    return profile.release();
}

// Adds an object in no database and closes it; id is set on success.
Hsys::ErrorStatus add(HsDbDatabase& database, std::unique_ptr<HsDbObject> object,
                      HsDbObjectId& id) {
    if (object == nullptr)
        return Hsys::eNullPointer;
    const Hsys::ErrorStatus status = database.addHsDbObject(id, object.get());
    if (status != Hsys::eSuccess)
        return status;
    return object.release()->close();
}

Hsys::ErrorStatus addRoom(HsDbDatabase& database, const Room& room,
                          const HsDbObjectId (&modifiers)[kCountingModifiers], HsDbObjectId& id) {
    auto area = std::make_unique<ZyrDbArea>();
    ZyrGeProfile* profile = rectangle(room.width, room.depth);
    if (profile == nullptr)
        return Hsys::eInvalidInput;
    Hsys::ErrorStatus status = area->setProfile(profile);
    if (status == Hsys::eSuccess)
        status = area->setName(room.name);
    if (status == Hsys::eSuccess && room.counting != kInFull)
        status = ZyrDbAreaModifierOperations::appendModifier(area.get(), modifiers[room.counting]);
    return status == Hsys::eSuccess ? add(database, std::move(area), id) : status;
}

Hsys::ErrorStatus addModifier(HsDbDatabase& database, const Modifier& data, HsDbObjectId& id) {
    auto modifier = std::make_unique<ZyrDbAreaModifier>();
    Hsys::ErrorStatus status = modifier->setExpression(data.formula);
    if (status == Hsys::eSuccess && data.parameterName != nullptr)
        status = modifier->addParameter(data.parameterName, data.parameterValue);
    if (status == Hsys::eSuccess)
        status = modifier->removeAlgorithm(ZyrAreaCalculationPerimeterAlgorithm::desc());
    if (status == Hsys::eSuccess)
        status = ZyrDictAreaModifiers(&database).addNewRecord(data.name, modifier.get(), id);
    if (status != Hsys::eSuccess)
        return status;
    return modifier.release()->close();
}

Hsys::ErrorStatus addGroup(HsDbDatabase& database, const wchar_t* name, const Ids& groups,
                           const Ids& areas, HsDbObjectId& id) {
    auto group = std::make_unique<ZyrDbAreaGroup>();
    Hsys::ErrorStatus status = group->setName(name);
    if (status == Hsys::eSuccess)
        status = database.addHsDbObject(id, group.get());
    if (status != Hsys::eSuccess)
        return status;
    // The database owns the group from here; members can be linked only to a group in it.
    ZyrDbAreaGroup* added = group.release();
    // The handler refuses an empty list.
    if (!groups.empty())
        status = added->groupHandler()->addNodes(groups);
    if (status == Hsys::eSuccess && !areas.empty())
        status = added->groupHandler()->addLeafs(areas);
    const Hsys::ErrorStatus closed = added->close();
    return status == Hsys::eSuccess ? closed : status;
}

Hsys::ErrorStatus addSample(HsDbDatabase& database) {
    std::unique_ptr<ZyrDbArea> sample(ZyrAreaDbOperations::sample(&database));
    if (sample == nullptr)
        return Hsys::eNullPointer;
    const Hsys::ErrorStatus status = sample->setName(kSampleName);
    HsDbObjectId id;
    return status == Hsys::eSuccess ? add(database, std::move(sample), id) : status;
}

Hsys::ErrorStatus prepare(HsDbDatabase& database) {
    database.setDrawingUnits(HsDb::kUnitsMeters);
    database.setDisplayUnits(HsDb::kUnitsMeters);
    if (const Hsys::ErrorStatus status = database.setDisplayPrecision(2); status != Hsys::eSuccess)
        return status;
    const bool valid = ZyrDictAreaStyle(&database).isValid(true, true) &&
                       ZyrDictAreaGroupStyle(&database).isValid(true, true) &&
                       ZyrDictAreaModifiers(&database).isValid(true, false);
    return valid ? Hsys::eSuccess : Hsys::eInvalidDictionary;
}

Hsys::ErrorStatus addHouse(HsDbDatabase& database) {
    HsDbObjectId modifiers[kCountingModifiers];
    for (int counting = 0; counting < kCountingModifiers; ++counting)
        if (const Hsys::ErrorStatus status =
                addModifier(database, kModifiers[counting], modifiers[counting]);
            status != Hsys::eSuccess)
            return status;
    Ids roomsOf[kFloorCount];
    for (const Room& room : kRooms) {
        HsDbObjectId id;
        if (const Hsys::ErrorStatus status = addRoom(database, room, modifiers, id);
            status != Hsys::eSuccess)
            return status;
        roomsOf[room.floor].push_back(id);
    }
    Ids floors;
    for (int floor = 0; floor < kFloorCount; ++floor) {
        HsDbObjectId id;
        if (const Hsys::ErrorStatus status =
                addGroup(database, kFloorNames[floor], {}, roomsOf[floor], id);
            status != Hsys::eSuccess)
            return status;
        floors.push_back(id);
    }
    HsDbObjectId house;
    return addGroup(database, kHouseName, floors, {}, house);
}

} // namespace

Hsys::ErrorStatus ZyrDemoDrawing::build(HsDbDatabase& database) {
    Hsys::ErrorStatus status = prepare(database);
    if (status == Hsys::eSuccess)
        status = addHouse(database);
    return status == Hsys::eSuccess ? addSample(database) : status;
}
