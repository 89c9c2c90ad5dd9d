// The point of replacement for previews and the list of open drawings: a module may enter an object
// of a class derived from this one in the service dictionary, and it is used instead of the plain
// one, which makes no previews and knows only the working drawing.
#pragma once

#include "areacalc/calc/ZyrBitmapHandle.h"
#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/rx/HsRxService.h"

#include <utility>
#include <vector>

class HsDbDatabase;
class HsDbEntity;
class HsDbObjectId;
class ZyrHsDbDatabaseValuator;

class ZyrAreaCalculationBaseService : public HsRxService {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrAreaCalculationBaseService)

public:
    using DatabaseInfoVector = std::vector<std::pair<HsDbDatabase*, ZyrRmCString>>;

    // The virtual operations after those of a runtime object, in the order of their slots.
    // A preview of the entity in a display configuration; the plain service makes none.
    virtual ZyrBitmapHandle bitmap(HsDbEntity* entity, const HsDbObjectId& configuration,
                                   unsigned int width, unsigned int height,
                                   unsigned int colorDepth);
    // Appends the open databases that the valuator accepts, each with a name to show. The plain
    // service lists the working database as "Current Drawing". The flag is not looked at. The
    // status is eDoesNotApply on every path, and callers do not read it.
    virtual Hsys::ErrorStatus getOpenDatabaseInfo(DatabaseInfoVector& databases, bool flag,
                                                  const ZyrHsDbDatabaseValuator& valuator);

    // The key in the service dictionary.
    static const wchar_t* serviceName() { return mServiceName; }
    static constexpr const wchar_t* mServiceName = L"ZyrAreaCalculationBaseService";
};
