#include "areacalc/objects/ZyrGroupNodeTypes.h"

#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/base/res/ZyrRmCString.h"

namespace {

constexpr unsigned int kNoMembersText = 29057;
constexpr unsigned int kGroupText = 28987;
constexpr unsigned int kAreaText = 29007;

// A class without a decorator leaves name as it was: the caller starts it empty.
void classLabel(const HsRxClass* cls, unsigned int textForNoClass, ZyrRmCString& name) {
    if (cls == nullptr)
        ZyrAreaCalculationBaseApp::sStringFromResource(textForNoClass, name, false);
    else
        ZyrDecoratorManager::displayName(cls, name);
}

} // namespace

void ZyrGroupNodeTypes::displayName(unsigned short mode, HsRxClass* nodeClass, HsRxClass* leafClass,
                                    ZyrRmCString& out) {
    if (mode > kHighestMode)
        return;
    if (mode == kNoOwner) {
        ZyrAreaCalculationBaseApp::sStringFromResource(kNoMembersText, out, false);
        return;
    }
    out.Empty();
    if ((mode & kNodeOwner) != 0)
        classLabel(nodeClass, kGroupText, out);
    if ((mode & kLeafOwner) == 0)
        return;
    ZyrRmCString leafName;
    classLabel(leafClass, kAreaText, leafName);
    if (out.IsEmpty())
        out = leafName;
    else
        out = out + L", " + leafName;
}
