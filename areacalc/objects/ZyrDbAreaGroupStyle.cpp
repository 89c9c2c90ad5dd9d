#include "areacalc/objects/ZyrDbAreaGroupStyle.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrImpAreaGroupStyle, ZyrImpDictRecord,
                            ZyrImpAreaGroupStyle::kProxyFlags,
                            hsrxInstantiateClass<ZyrImpAreaGroupStyle>,
                            ZyrRxClassDecorator::kNoText, ZyrRxClassDecorator::kNoText)
ZYR_AREACALC_DEFINE_FILED_MEMBERS(ZyrDbAreaGroupStyle, ZyrDbDictRecord, L"ZYR_ZYRDBAREAGROUPSTYLE",
                                  29008, 28960)
