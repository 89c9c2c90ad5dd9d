#include "platform/base/app/ZyrHdxEquipment.h"

#include "platform/base/res/ZyrRmCString.h"

void ZyrHdxEquipment::multipleSubst(ZyrRmCString& text, const ZyrRmCString& from,
                                    const ZyrRmCString& to) {
    text.Replace(from, to);
}
