#include "platform/host/db/HsDbHostApplicationServices.h"

HsDbHostApplicationServices* hsdbHostApplicationServices() {
    static HsDbHostApplicationServices services;
    return &services;
}
