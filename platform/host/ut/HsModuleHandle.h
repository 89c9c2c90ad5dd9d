// The opaque handle of a loaded module image.
#pragma once

using HsModuleHandle = void*;

// The record of an attached extension module: whether it is set up, its image and its resources.
struct AFX_EXTENSION_MODULE {
    int bInitialized = 0;
    HsModuleHandle hModule = nullptr;
    HsModuleHandle hResource = nullptr;
};
