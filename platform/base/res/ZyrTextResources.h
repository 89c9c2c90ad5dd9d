// The process-wide registry of text resources: each module enters its table of texts by number
// under its application name, and strings are built from (application, number).
#pragma once

#include "platform/base/res/ZyrRmCString.h"

#include <cstdint>
#include <map>
#include <string>
#include <string_view>

class ZyrTextResources {
public:
    using Table = std::map<unsigned int, std::wstring>;

    // Enters a module's table, replacing one registered before under the same name.
    static void registerTable(const std::wstring& appName, Table table);
    static void unregisterTable(const std::wstring& appName);
    static bool hasTable(const std::wstring& appName);

    // The wording, or null when the module or the number is unknown. Copies of it share its
    // buffer.
    static const ZyrRmCString* find(std::wstring_view appName, unsigned int id);

    // Changes with every registration and removal of a table, never to zero: a text kept from
    // an earlier generation may have changed.
    static std::uint64_t generation();

    // What an unknown text reads as: visible, and naming what is missing.
    static std::wstring placeholder(std::wstring_view appName, unsigned int id);
};
