// Area styles: the dictionary records that areas refer to, which carry what the areas of one kind
// share.
#pragma once

#include "areacalc/objects/ZyrDbPair.h"
#include "areacalc/objects/ZyrImpPair.h"
#include "platform/base/obj/ZyrDbDictRecord.h"
#include "platform/base/obj/ZyrImpDictRecord.h"

class ZyrDbArea;

// A style is its name and what ZyrImpDictRecord holds; it adds no field of its own. Binary
// filing after ZyrImpDictRecord's: int16 80 alone.
class ZyrImpAreaStyle : public ZyrImpPair<ZyrImpAreaStyle, ZyrImpDictRecord> {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrImpAreaStyle)
};

class ZyrDbAreaStyle : public ZyrDbPair<ZyrDbAreaStyle, ZyrDbDictRecord, ZyrImpAreaStyle> {
    ZYR_AREACALC_DECLARE_FILED_MEMBERS(ZyrDbAreaStyle)

public:
    static constexpr const wchar_t* kClassIdWord = L"ZyrAreaStyle";

    using ZyrDbPair::ZyrDbPair;

    // The sample area of the style's previews (ZyrAreaDbOperations::sample) with this style: new,
    // in no database, owned by the caller. Null when it cannot be made.
    ZyrDbArea* getSample() const;

    ZyrImpAreaStyle* areaStyleImp() { return pairImp(); }
    const ZyrImpAreaStyle* areaStyleImp() const { return pairImp(); }
};
