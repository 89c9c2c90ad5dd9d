#include "areacalc/objects/ZyrWriteToRead.h"

#include "platform/host/db/HsDbObject.h"

ZyrWriteToRead::ZyrWriteToRead(HsDbObject* object) : m_object(object) {
    if (m_object == nullptr) {
        m_status = Hsys::eNullPointer;
        return;
    }
    if (!m_object->isWriteEnabled())
        return;
    m_status = m_object->downgradeOpen();
    m_restore = m_status == Hsys::eSuccess;
}

ZyrWriteToRead::~ZyrWriteToRead() {
    // The object was open for write with this one open when the scope began; the upgrade can fail
    // only when a walker inside the scope left a read open, and then the caller's next write
    // assertion says so.
    if (m_restore)
        m_object->upgradeOpen();
}
