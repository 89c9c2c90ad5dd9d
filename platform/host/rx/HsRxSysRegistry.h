// The host's root dictionary, which lives for the whole process.
#pragma once

class HsRxDictionary;

// Keys of the root dictionary.
inline constexpr const wchar_t* kHsRxClassDictionary = L"ClassDictionary";
inline constexpr const wchar_t* kHsRxServiceDictionary = L"ServiceDictionary";
inline constexpr const wchar_t* kHsRxDynamicLinker = L"DynamicLinker";

// Holds "ClassDictionary" (an HsRxDictionary of HsRxClass), "ServiceDictionary" (an
// HsRxDictionary of HsRxService) and "DynamicLinker" (the HsRxDynamicLinker).
HsRxDictionary* hsrxSysRegistry();
