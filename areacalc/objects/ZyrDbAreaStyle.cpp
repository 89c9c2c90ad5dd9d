#include "areacalc/objects/ZyrDbAreaStyle.h"

#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "areacalc/objects/ZyrDbArea.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrImpAreaStyle, ZyrImpDictRecord, ZyrImpAreaStyle::kProxyFlags,
                            hsrxInstantiateClass<ZyrImpAreaStyle>, ZyrRxClassDecorator::kNoText,
                            ZyrRxClassDecorator::kNoText)
ZYR_AREACALC_DEFINE_FILED_MEMBERS(ZyrDbAreaStyle, ZyrDbDictRecord, L"ZYR_ZYRDBAREASTYLE", 29010,
                                  28963)

ZyrDbArea* ZyrDbAreaStyle::getSample() const {
    ZyrDbArea* sample = ZyrAreaDbOperations::sample(database());
    if (sample != nullptr)
        sample->setStyleId(objectId());
    return sample;
}
