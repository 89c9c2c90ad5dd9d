#include "areacalc/module/ZyrAreaCalculationBaseApp.h"

void ZyrAreaCalculationBaseApp::sStringFromResource(unsigned int id, ZyrRmCString& out, bool flag) {
    out = ZyrRmCString(kAppName, id, flag);
}

ZyrRmCString ZyrAreaCalculationBaseApp::sStringFromResource(unsigned int id, bool flag) {
    return ZyrRmCString(kAppName, id, flag);
}
