#include "platform/base/obj/ZyrTransactable.h"

void ZyrTransactable::startTransaction() { m_copies.push_back(instance()->clone()); }

void ZyrTransactable::endTransaction() {
    if (m_copies.empty())
        return;
    ZyrTransactable* done = m_copies.back();
    m_copies.pop_back();
    instance()->copyFrom(done);
    delete done;
}

void ZyrTransactable::abortTransaction() {
    if (m_copies.empty())
        return;
    delete m_copies.back();
    m_copies.pop_back();
}

ZyrTransactable::~ZyrTransactable() {
    for (ZyrTransactable* copy : m_copies)
        delete copy;
}

ZyrTransactable* ZyrTransactable::instance() { return m_copies.empty() ? this : m_copies.back(); }

const ZyrTransactable* ZyrTransactable::instance() const {
    return m_copies.empty() ? this : m_copies.back();
}
