// What the host says to a loaded module, what the module answers, and the modules that declared
// themselves safe for several open documents.
#pragma once

namespace HsRx {

enum AppMsgCode {
    kInitAppMsg = 0,
    kUnloadAppMsg = 1,
    kLoadBdfMsg = 2,
    kUnloadBdfMsg = 3,
    kSaveMsg = 4,
    kEndMsg = 5,
    kQuitMsg = 6,
};

enum AppRetCode {
    eOk = 0,
    eRetError = 3,
};

} // namespace HsRx

// Declares a module safe for several open documents; the application pointer is what the host
// handed the module with its init message.
void hsrxRegisterAppMDIAware(void* appPtr);
bool hsrxIsAppMDIAware(const void* appPtr);
void hsrxUnregisterAppMDIAware(void* appPtr);
