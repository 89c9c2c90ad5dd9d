// Area group styles: the dictionary records that area groups refer to, which carry what the
// groups of one kind share.
#pragma once

#include "areacalc/objects/ZyrDbPair.h"
#include "areacalc/objects/ZyrImpPair.h"
#include "platform/base/obj/ZyrDbDictRecord.h"
#include "platform/base/obj/ZyrImpDictRecord.h"

class ZyrDbAreaGroup;

// A style is its name and what ZyrImpDictRecord holds; it adds no field of its own. Binary
// filing after ZyrImpDictRecord's: int16 80 alone.
class ZyrImpAreaGroupStyle : public ZyrImpPair<ZyrImpAreaGroupStyle, ZyrImpDictRecord> {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrImpAreaGroupStyle)
};

class ZyrDbAreaGroupStyle
    : public ZyrDbPair<ZyrDbAreaGroupStyle, ZyrDbDictRecord, ZyrImpAreaGroupStyle> {
    ZYR_AREACALC_DECLARE_FILED_MEMBERS(ZyrDbAreaGroupStyle)

public:
    static constexpr const wchar_t* kClassIdWord = L"ZyrAreaGroupStyle";

    using ZyrDbPair::ZyrDbPair;

    // The sample group of the style's previews (ZyrAreaGroupDbOperations::sample) with this style:
    // new, in no database, owned by the caller. Null when it cannot be made.
    ZyrDbAreaGroup* getSample() const;

    ZyrImpAreaGroupStyle* areaGroupStyleImp() { return pairImp(); }
    const ZyrImpAreaGroupStyle* areaGroupStyleImp() const { return pairImp(); }
};
