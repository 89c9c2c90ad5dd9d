#include "areacalc/module/ZyrAreaCalculationBaseModule.h"

HsModuleHandle _hdllInstance = nullptr;
