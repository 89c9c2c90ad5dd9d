#include "platform/host/ut/HsGuid.h"

#include "platform/host/ut/HsutFormat.h"

std::wstring hsGuidToString(const _GUID& id) {
    return hsutFormat(L"{%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X}", id.Data1, id.Data2, id.Data3,
                      id.Data4[0], id.Data4[1], id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5],
                      id.Data4[6], id.Data4[7]);
}
