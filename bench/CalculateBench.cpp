// A whole calculation of 1,000 to 100,000 areas in three levels of groups, against the floor of
// any calculation: a plain loop that opens every area and reads its area; and, between the two,
// the reading every calculation does before it records anything: the members of each group by
// name, each area opened once for its name and once more for its value.
#include "areacalc/calc/ZyrAreaCalculationEngine.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationStream.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDictAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictAreaStyle.h"
#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/geom/ZyrGeSegment2d.h"
#include "platform/host/db/HsDbDatabase.h"
#include "tools/zyrarea/ZyrAreaToolHost.h"

#include <benchmark/benchmark.h>

#include <map>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using Ids = std::vector<HsDbObjectId>;

// Rooms per floor group and floors per building group; the buildings hang under one site.
constexpr size_t kRoomsPerFloor = 50;
constexpr size_t kFloorsPerBuilding = 10;

void check(Hsys::ErrorStatus status, const char* what) {
    if (status != Hsys::eSuccess)
        throw std::runtime_error(std::string(what) + ": " + Hsys::toString(status));
}

ZyrAreaToolHost& host() {
    static ZyrAreaToolHost running;
    check(running.status(), "starting the module");
    return running;
}

ZyrGeProfile* room(double width, double depth) {
    const HsGePoint2d corners[] = {{0, 0}, {width, 0}, {width, depth}, {0, depth}};
    auto* ring = new ZyrGeRing;
    for (int i = 0; i < 4; ++i)
        check(ring->addSegment(new ZyrGeSegment2d(corners[i], corners[(i + 1) % 4])), "a side");
    auto* profile = new ZyrGeProfile;
    check(profile->addRing(ring), "a ring");
    return profile;
}

HsDbObjectId addGroup(HsDbDatabase& database, const std::wstring& name, const Ids& groups,
                      const Ids& areas) {
    auto* group = new ZyrDbAreaGroup;
    check(group->setName(name), "a group name");
    HsDbObjectId id;
    check(database.addHsDbObject(id, group), "adding a group");
    if (!groups.empty())
        check(group->groupHandler()->addNodes(groups), "its groups");
    if (!areas.empty())
        check(group->groupHandler()->addLeafs(areas), "its areas");
    group->close();
    return id;
}

// A site of buildings of floors of rooms, all rooms of different sizes; made once per size.
struct Site {
    explicit Site(size_t areaCount) {
        host();
        if (!ZyrDictAreaStyle(&database).isValid(true, true) ||
            !ZyrDictAreaGroupStyle(&database).isValid(true, true))
            throw std::runtime_error("no style dictionaries");
        Ids buildings;
        Ids floors;
        Ids rooms;
        for (size_t i = 0; i < areaCount; ++i) {
            auto* area = new ZyrDbArea;
            check(area->setName(L"Room " + std::to_wstring(i)), "a room name");
            check(area->setProfile(room(3.0 + static_cast<double>(i % 7), 4.0)), "a room");
            HsDbObjectId id;
            check(database.addHsDbObject(id, area), "adding a room");
            area->close();
            areas.push_back(id);
            rooms.push_back(id);
            if (rooms.size() == kRoomsPerFloor || i + 1 == areaCount) {
                floors.push_back(addGroup(database, L"Floor " + std::to_wstring(i), {}, rooms));
                floorRooms.push_back(rooms);
                rooms.clear();
            }
            if (floors.size() == kFloorsPerBuilding || (i + 1 == areaCount && !floors.empty())) {
                buildings.push_back(
                    addGroup(database, L"Building " + std::to_wstring(i), floors, {}));
                floors.clear();
            }
        }
        site = addGroup(database, L"Site", buildings, {});
    }

    HsDbDatabase database;
    Ids areas;
    // The rooms of each floor, in the order the floor holds them.
    std::vector<Ids> floorRooms;
    HsDbObjectId site;
};

Site& siteOf(size_t areaCount) {
    static std::map<size_t, std::unique_ptr<Site>> sites;
    std::unique_ptr<Site>& site = sites[areaCount];
    if (site == nullptr)
        site = std::make_unique<Site>(areaCount);
    return *site;
}

// The board holds the area algorithm, and the perimeter algorithm when asked for.
void attachPerimeter(bool attach) {
    ZyrAreaCalculationWhiteBoard* board = ZyrAreaCalculationHdxServices::service()->whiteBoard();
    HsRxClass* perimeter = ZyrAreaCalculationPerimeterAlgorithm::desc();
    if (attach != (board->algorithm(perimeter) != nullptr))
        check(attach ? board->attachAlgorithm(perimeter) : board->detachAlgorithm(perimeter),
              "the perimeter algorithm");
}

// The sum of the areas of the ids, each opened for read in turn.
double sumOfAreas(const Ids& ids) {
    double sum = 0.0;
    for (const HsDbObjectId& id : ids) {
        ZyrDbArea* area = nullptr;
        if (ZyrDbArea::open(area, id, HsDb::kForRead) != Hsys::eSuccess)
            continue;
        sum += area->area();
        area->close();
    }
    return sum;
}

void BM_OpenEveryArea(benchmark::State& state) {
    const Site& site = siteOf(static_cast<size_t>(state.range(0)));
    for (auto _ : state)
        benchmark::DoNotOptimize(sumOfAreas(site.areas));
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

void BM_OpenInNameOrder(benchmark::State& state) {
    const Site& site = siteOf(static_cast<size_t>(state.range(0)));
    for (auto _ : state) {
        double sum = 0.0;
        for (const Ids& floor : site.floorRooms) {
            Ids rooms = floor;
            ZyrACFunctional::sortNamedObjects(rooms, static_cast<ZyrDbArea*>(nullptr));
            sum += sumOfAreas(rooms);
        }
        benchmark::DoNotOptimize(sum);
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

void calculateSite(benchmark::State& state, bool withPerimeter) {
    const Site& site = siteOf(static_cast<size_t>(state.range(0)));
    attachPerimeter(withPerimeter);
    for (auto _ : state) {
        auto stream = std::make_unique<ZyrAreaCalculationStream>();
        ZyrAreaCalculationEngine engine;
        check(engine.calculate({site.site}, stream.get(), nullptr, nullptr), "the calculation");
        benchmark::DoNotOptimize(stream->roots().data());
        // Freeing the result is its reader's business, not the calculation's.
        state.PauseTiming();
        stream.reset();
        state.ResumeTiming();
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

void BM_CalculateArea(benchmark::State& state) {
    calculateSite(state, false);
}

void BM_CalculateAreaAndPerimeter(benchmark::State& state) {
    calculateSite(state, true);
}

BENCHMARK(BM_OpenEveryArea)
    ->RangeMultiplier(10)
    ->Range(1000, 100000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BM_OpenEveryArea)->Arg(50000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_OpenInNameOrder)
    ->RangeMultiplier(10)
    ->Range(1000, 100000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BM_CalculateArea)
    ->RangeMultiplier(10)
    ->Range(1000, 100000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BM_CalculateArea)->Arg(50000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_CalculateAreaAndPerimeter)
    ->RangeMultiplier(10)
    ->Range(1000, 100000)
    ->Unit(benchmark::kMillisecond);

} // namespace
