#include "areacalc/calc/ZyrAreaDbOperations.h"

#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "platform/base/app/ZyrEntityLayer.h"
#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ge/HsGeLineSeg2d.h"

#include <memory>
#include <new>

namespace {

using AreaValue = double (ZyrDbArea::*)() const;

Hsys::ErrorStatus grossValue(ZyrDbArea* area, AreaValue read, double& value) {
    if (area == nullptr)
        return Hsys::eNullPointer;
    value = (area->*read)();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus modifiedValue(ZyrDbArea* area, AreaValue read, HsRxClass* algorithm,
                                double& value) {
    value = (area->*read)();
    return ZyrDbAreaModifierOperations::applyTo(area, algorithm, value);
}

// One value of the area behind an id, through the pointer form. The open's failure comes back as
// it is; an open that succeeds without an object gives eNullPointer.
template <class ValueOfArea>
Hsys::ErrorStatus valueById(const HsDbObjectId& id, ValueOfArea valueOf) {
    HsDbObjectPointer<ZyrDbArea> area(id, HsDb::kForRead);
    if (area.openStatus() != Hsys::eSuccess)
        return area.openStatus();
    if (!area)
        return Hsys::eNullPointer;
    return valueOf(area.object());
}

// A ring of straight segments through the corners in order, back to the first.
void addLines(ZyrGeRing& ring, std::initializer_list<HsGePoint2d> corners) {
    const HsGePoint2d* previous = nullptr;
    for (const HsGePoint2d& corner : corners) {
        if (previous != nullptr)
            static_cast<void>(
                ring.addSegment(new ZyrGeSegment2d(new HsGeLineSeg2d(*previous, corner)), true));
        previous = &corner;
    }
}

// The outline: a 10 by 8 rectangle whose corner at (10, -8) gives way to three quarters of the
// circle of radius 4 around it.
std::unique_ptr<ZyrGeRing> sampleOutline() {
    auto ring = std::make_unique<ZyrGeRing>();
    addLines(*ring, {{0, 0}, {10, 0}, {10, -4}});
    static_cast<void>(ring->addSegment(
        new ZyrGeSegment2d(new HsGeCircArc2d({10, -4}, {10, -12}, {6, -8})), true));
    addLines(*ring, {{6, -8}, {0, -8}, {0, 0}});
    if (ring->area() < 0.0)
        ring->reverse();
    return ring;
}

std::unique_ptr<ZyrGeRing> sampleHole() {
    auto ring = std::make_unique<ZyrGeRing>();
    addLines(*ring, {{1.7, -6.64}, {9.2, -6.64}, {5.45, -0.64}, {1.7, -6.64}});
    if (ring->area() >= 0.0)
        ring->reverse();
    return ring;
}

} // namespace

ZyrDbArea* ZyrAreaDbOperations::sample(HsDbDatabase* database) {
    if (database == nullptr)
        database = hsdbHostApplicationServices()->workingDatabase();
    std::unique_ptr<ZyrDbArea> area(new (std::nothrow) ZyrDbArea);
    if (area == nullptr)
        return nullptr;
    area->initializeStandardsAndDefaults(database);
    Zyr::setLayer(area.get(), database);
    auto profile = std::make_unique<ZyrGeProfile>();
    static_cast<void>(profile->addRing(sampleOutline().release()));
    static_cast<void>(profile->addRing(sampleHole().release()));
    area->setProfile(profile.release());
    return area.release();
}

Hsys::ErrorStatus ZyrAreaDbOperations::area(ZyrDbArea* area, double& value) {
    return grossValue(area, &ZyrDbArea::area, value);
}

Hsys::ErrorStatus ZyrAreaDbOperations::perimeter(ZyrDbArea* area, double& value) {
    return grossValue(area, &ZyrDbArea::perimeter, value);
}

Hsys::ErrorStatus ZyrAreaDbOperations::areaModified(ZyrDbArea* area, double& value) {
    return modifiedValue(area, &ZyrDbArea::area, ZyrAreaCalculationAreaAlgorithm::desc(), value);
}

Hsys::ErrorStatus ZyrAreaDbOperations::perimeterModified(ZyrDbArea* area, double& value) {
    return modifiedValue(area, &ZyrDbArea::perimeter, ZyrAreaCalculationPerimeterAlgorithm::desc(),
                         value);
}

Hsys::ErrorStatus ZyrAreaDbOperations::area(const HsDbObjectId& id, double& value) {
    return valueById(id, [&](ZyrDbArea* area) { return ZyrAreaDbOperations::area(area, value); });
}

Hsys::ErrorStatus ZyrAreaDbOperations::perimeter(const HsDbObjectId& id, double& value) {
    return valueById(id, [&](ZyrDbArea* area) { return ZyrAreaDbOperations::perimeter(area, value); });
}

Hsys::ErrorStatus ZyrAreaDbOperations::areaModified(const HsDbObjectId& id, double& value) {
    return valueById(id, [&](ZyrDbArea* area) { return areaModified(area, value); });
}

Hsys::ErrorStatus ZyrAreaDbOperations::perimeterModified(const HsDbObjectId& id, double& value) {
    return valueById(id, [&](ZyrDbArea* area) { return perimeterModified(area, value); });
}
