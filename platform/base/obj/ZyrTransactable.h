// An object with transactions of its own: starting one puts a clone in force, ending it copies the
// clone back, aborting it drops the clone. Readers go through instance() to see the copy in force.
#pragma once

#include <vector>

class ZyrTransactable {
public:
    ZyrTransactable() = default;
    ZyrTransactable(const ZyrTransactable&) = delete;
    ZyrTransactable& operator=(const ZyrTransactable&) = delete;

    // The virtual operations, in the order of their slots.
    virtual void startTransaction();
    virtual void endTransaction();
    virtual void abortTransaction();
    virtual ~ZyrTransactable();
    virtual ZyrTransactable* clone() const = 0;
    virtual void copyFrom(const ZyrTransactable* other) = 0;

    // The copy of the innermost running transaction, or the object itself outside transactions.
    ZyrTransactable* instance();
    const ZyrTransactable* instance() const;
    int transactionDepth() const { return static_cast<int>(m_copies.size()); }

private:
    std::vector<ZyrTransactable*> m_copies;
};
