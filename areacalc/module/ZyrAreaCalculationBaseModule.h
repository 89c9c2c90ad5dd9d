// The handle of the module's loaded image. Every class decorator of the module holds its address,
// since the handle is known only once the image is attached, after the decorators were built.
#pragma once

#include "platform/host/ut/HsModuleHandle.h"

extern HsModuleHandle _hdllInstance;
