#include "areacalc/objects/ZyrCompSpecTemplate.h"

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDbAreaGroupStyle.h"
#include "areacalc/objects/ZyrDbAreaStyle.h"

template <class Object, class Style>
HsRxClass* ZyrCompSpecTemplate<Object, Style>::gpDesc = nullptr;

template <class Object, class Style> HsRxClass* ZyrCompSpecTemplate<Object, Style>::rxInit() {
    return ZyrAreaCalculationClassRegistration::rxInit(gpDesc, kClassName, ZyrCompSpec::desc(), 80,
                                                       kFactory);
}

HsRxObject* makeZyrCompSpecArea() {
    return new ZyrCompSpecArea();
}

template <> const wchar_t* const ZyrCompSpecArea::kClassName = L"ZyrCompSpecArea";
template <> const HsRxClass::PseudoConstructor ZyrCompSpecArea::kFactory = makeZyrCompSpecArea;
template class ZyrCompSpecTemplate<ZyrDbArea, ZyrDbAreaStyle>;

ZyrRxClassDecorator gZyrDecoratorZyrCompSpecArea(typeid(ZyrCompSpecArea), typeid(ZyrCompSpec),
                                                 &ZyrCompSpecArea::rxInit, &ZyrCompSpecArea::desc,
                                                 &_hdllInstance, ZyrRxClassDecorator::kNoText,
                                                 ZyrRxClassDecorator::kNoText);

HsRxObject* makeZyrCompSpecAreaGroup() {
    return new ZyrCompSpecAreaGroup();
}

template <> const wchar_t* const ZyrCompSpecAreaGroup::kClassName = L"ZyrCompSpecAreaGroup";
template <>
const HsRxClass::PseudoConstructor ZyrCompSpecAreaGroup::kFactory = makeZyrCompSpecAreaGroup;
template class ZyrCompSpecTemplate<ZyrDbAreaGroup, ZyrDbAreaGroupStyle>;

ZyrRxClassDecorator gZyrDecoratorZyrCompSpecAreaGroup(typeid(ZyrCompSpecAreaGroup),
                                                      typeid(ZyrCompSpec),
                                                      &ZyrCompSpecAreaGroup::rxInit,
                                                      &ZyrCompSpecAreaGroup::desc, &_hdllInstance,
                                                      ZyrRxClassDecorator::kNoText,
                                                      ZyrRxClassDecorator::kNoText);
