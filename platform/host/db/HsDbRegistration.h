// Host use: registers a persistent class when the library loads, so that a drawing file read
// before any use of the class still finds it by name.
#pragma once

#include "platform/host/rx/HsRxClass.h"

#define HSDB_REGISTER_AT_LOAD(CLASS)                                                               \
    namespace {                                                                                    \
    [[maybe_unused]] const HsRxClass* const gRegistered##CLASS = CLASS::desc();                    \
    }
