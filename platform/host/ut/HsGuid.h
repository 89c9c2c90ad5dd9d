// A 128-bit class id, laid out as the host files it.
#pragma once

#include <cstdint>
#include <string>

struct _GUID {
    uint32_t Data1 = 0;
    uint16_t Data2 = 0;
    uint16_t Data3 = 0;
    uint8_t Data4[8] = {};

    bool isNull() const { return *this == _GUID(); }
    friend bool operator==(const _GUID&, const _GUID&) = default;
};

// "{XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX}", upper case.
std::wstring hsGuidToString(const _GUID& id);
