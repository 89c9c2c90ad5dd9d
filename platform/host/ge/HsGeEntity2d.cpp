// The root of the plane geometry objects that are handled through a base pointer.
#include "platform/host/ge/HsGeEntity2d.h"

HsGeEntity2d::~HsGeEntity2d() = default;
