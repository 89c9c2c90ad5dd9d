#include "areacalc/objects/ZyrDictAreaModifiers.h"

#include "platform/base/obj/ZyrClassId.h"

ZYR_AREACALC_DEFINE_MEMBERS(ZyrDictAreaModifiers, ZyrDict, 0, nullptr, 28991,
                            ZyrRxClassDecorator::kNoText)

ZyrDictAreaModifiers::ZyrDictAreaModifiers(HsDbDatabase* database)
    : ZyrDict(kDictionaryName, Zyr::classNameToClass(L"ZyrDbAreaModifier"), nullptr, false,
              database) {}

ZyrDictAreaModifiers::~ZyrDictAreaModifiers() = default;
