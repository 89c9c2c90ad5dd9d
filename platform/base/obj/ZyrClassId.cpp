#include "platform/base/obj/ZyrClassId.h"

#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/host/rx/HsRxClass.h"

namespace {

// FNV-1a over the text's code points, run twice with different bases for 128 bits.
uint64_t fnv1a(const std::wstring& text, uint64_t basis) {
    uint64_t hash = basis;
    for (wchar_t c : text) {
        auto value = static_cast<uint32_t>(c);
        for (int byte = 0; byte < 4; ++byte) {
            hash ^= (value >> (8 * byte)) & 0xFF;
            hash *= 0x100000001B3ULL;
        }
    }
    return hash;
}

Hsys::ErrorStatus idFromText(const wchar_t* text, const wchar_t* kind, _GUID* id) {
    if (text == nullptr || *text == L'\0' || id == nullptr)
        return Hsys::eInvalidInput;
    const std::wstring keyed = std::wstring(kind) + L":" + text;
    const uint64_t high = fnv1a(keyed, 0xCBF29CE484222325ULL);
    const uint64_t low = fnv1a(keyed, 0x84222325CBF29CE4ULL);
    id->Data1 = static_cast<uint32_t>(high >> 32);
    id->Data2 = static_cast<uint16_t>(high >> 16);
    // Version 8 (a custom, name-derived id) and the standard variant bits.
    id->Data3 = static_cast<uint16_t>((high & 0x0FFF) | 0x8000);
    for (int i = 0; i < 8; ++i)
        id->Data4[i] = static_cast<uint8_t>(low >> (56 - 8 * i));
    id->Data4[0] = static_cast<uint8_t>((id->Data4[0] & 0x3F) | 0x80);
    return Hsys::eSuccess;
}

} // namespace

namespace Zyr {

ZyrRmCString constructClassID(const wchar_t* classIdWord) {
    ZyrRmCString text;
    text.Format(L"Zyr.%s.ClassId", classIdWord != nullptr ? classIdWord : L"");
    return text;
}

Hsys::ErrorStatus getEntityClassIdFromString(const wchar_t* classIdText, _GUID* id) {
    return idFromText(classIdText, L"entity", id);
}

Hsys::ErrorStatus getObjectClassIdFromString(const wchar_t* classIdText, _GUID* id) {
    return idFromText(classIdText, L"object", id);
}

HsRxClass* classNameToClass(const wchar_t* className) { return hsrxFindHsRxClass(className); }

void classTypeToDisplayName(const HsRxClass* cls, ZyrRmCString& out) {
    if (cls == nullptr) {
        out.Empty();
        return;
    }
    if (!ZyrDecoratorManager::displayName(cls, out))
        out = cls->name();
}

} // namespace Zyr
