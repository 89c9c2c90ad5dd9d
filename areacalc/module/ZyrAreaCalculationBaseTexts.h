// The module's text resource: every text the module shows, by its fixed number.
#pragma once

#include "platform/base/res/ZyrTextResources.h"

#include <cstddef>

class ZyrAreaCalculationBaseTexts {
public:
    // The name under which the texts are registered, and which every text lookup names.
    static constexpr const wchar_t* kAppName = L"ZyrAreaCalculationBase80";

    static const ZyrTextResources::Table& table();
    // How many texts the table was written with; a number written twice makes the table smaller.
    static size_t entryCount();
    // Enters the table in the registry; doing it again changes nothing.
    static void registerTexts();
    static void unregisterTexts();
};
