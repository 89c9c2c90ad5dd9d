// A scope in which an object open for write is open for read only, so that walks over a tree of
// groups can open it for read again.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

class HsDbObject;

// Downgrades an object that is open for write when the scope begins and upgrades it again when the
// scope ends. An object open for read stays as it is. status(): eNullPointer for no object, the
// result of downgradeOpen for an object open for write, else eSuccess. Only a successful downgrade
// is undone.
class ZyrWriteToRead {
public:
    explicit ZyrWriteToRead(HsDbObject* object);
    // Destructors do not throw: an exception out of the upgrade ends the process.
    ~ZyrWriteToRead();
    ZyrWriteToRead(const ZyrWriteToRead&) = delete;
    ZyrWriteToRead& operator=(const ZyrWriteToRead&) = delete;

    Hsys::ErrorStatus status() const { return m_status; }

private:
    HsDbObject* m_object;
    Hsys::ErrorStatus m_status = Hsys::eSuccess;
    bool m_restore = false;
};
