// The process-wide geometry tolerance.
#include "platform/host/ge/HsGeContext.h"

HsGeTol HsGeContext::gTol;
