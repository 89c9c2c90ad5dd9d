#include "areacalc/objects/ZyrDbAreaGroupStyle.h"

#include "areacalc/calc/ZyrAreaGroupDbOperations.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrImpAreaGroupStyle, ZyrImpDictRecord,
                            ZyrImpAreaGroupStyle::kProxyFlags,
                            hsrxInstantiateClass<ZyrImpAreaGroupStyle>,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)
ZYR_AREACALC_DEFINE_FILED_MEMBERS(ZyrDbAreaGroupStyle, ZyrDbDictRecord, L"ZYR_ZYRDBAREAGROUPSTYLE",
                                  29008, 28960)

ZyrDbAreaGroup* ZyrDbAreaGroupStyle::getSample() const {
    ZyrDbAreaGroup* sample = ZyrAreaGroupDbOperations::sample(database());
    if (sample != nullptr)
        sample->setStyleId(objectId());
    return sample;
}
