#include "platform/base/obj/ZyrConvertLegacyExtendData.h"

ZyrConvertLegacyExtendData::ZyrConvertLegacyExtendData(HsDbBdfFiler* /*filer*/,
                                                       const HsRxObject* /*object*/,
                                                       const HsRxClass* /*cls*/) {}
