// The opaque handle of a loaded module image.
#pragma once

using HsModuleHandle = void*;
