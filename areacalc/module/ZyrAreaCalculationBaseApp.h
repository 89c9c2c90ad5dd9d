// The module's application: the texts of the module by number, and the names under which the
// module registers its classes.
#pragma once

#include "areacalc/module/ZyrAreaCalculationBaseTexts.h"
#include "platform/base/res/ZyrRmCString.h"

class ZyrAreaCalculationBaseApp {
public:
    // The application name, which names the module's texts.
    static constexpr const wchar_t* kAppName = ZyrAreaCalculationBaseTexts::kAppName;
    // The class application description of every filed class the module registers.
    static constexpr const wchar_t* kClassAppDescription =
        L"ZyrAreaCalculationBase80|Product Desc: Velmar Planwerk Suite 2007 |Company: Velmar,Inc. "
        L"|WEB Address: www.velmar.example";

    // The text of the module's resource id; flag is passed to ZyrRmCString unchanged (true drops
    // the menu mnemonics, as column names want).
    static void sStringFromResource(unsigned int id, ZyrRmCString& out, bool flag);
    static ZyrRmCString sStringFromResource(unsigned int id, bool flag);
};
