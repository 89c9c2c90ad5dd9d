// Iterators over the tree of area groups below one group, handing out each group open for read:
// forward (parents before children) and backward (the exact reverse).
#pragma once

#include "areacalc/objects/ZyrDbAreaGroupConstIteratorImp.h"

// Holds and owns one implementation object, to which every operation goes. The pointer handed out
// is valid until the next step, reset or the iterator's end; the root id must outlive the
// iterator. No operation gives a status: a group that cannot be opened shows as null.
class ZyrDbAreaGroupConstIterator {
public:
    explicit ZyrDbAreaGroupConstIterator(ZyrDbAreaGroupConstIteratorImp* imp) : m_imp(imp) {}
    ZyrDbAreaGroupConstIterator(const ZyrDbAreaGroupConstIterator&) = delete;
    ZyrDbAreaGroupConstIterator& operator=(const ZyrDbAreaGroupConstIterator&) = delete;

    // The virtual operations, in the order of their slots.
    virtual bool done() const = 0;
    virtual void reset() = 0;
    virtual ~ZyrDbAreaGroupConstIterator();

    ZyrDbAreaGroupConstIteratorImp* imp() { return m_imp; }
    const ZyrDbAreaGroupConstIteratorImp* imp() const { return m_imp; }

protected:
    // The const operations of the iterators stand for walks that open and close groups.
    ZyrDbAreaGroupConstIteratorImp* heldImp() const { return m_imp; }

private:
    ZyrDbAreaGroupConstIteratorImp* m_imp;
};

// The walk of ZyrDbAreaGroupConstForwardIteratorImp, with its rules for erased groups and groups
// that cannot be opened.
class ZyrDbAreaGroupConstForwardIterator : public ZyrDbAreaGroupConstIterator {
public:
    explicit ZyrDbAreaGroupConstForwardIterator(const HsDbObjectId& root);

    bool done() const override { return walk().done(); }
    void reset() override { walk().reset(); }
    ~ZyrDbAreaGroupConstForwardIterator() override;

    const ZyrDbAreaGroup* operator->() const { return walk().operator->(); }
    // Not const in effect: an erased group on top is passed over.
    const ZyrDbAreaGroup* operator*() const { return *walk(); }
    ZyrDbAreaGroupConstForwardIterator& operator++() {
        ++walk();
        return *this;
    }

private:
    ZyrDbAreaGroupConstForwardIteratorImp& walk() const;
};

// The walk of ZyrDbAreaGroupConstBackwardIteratorImp: the tree as it was at construction.
class ZyrDbAreaGroupConstBackwardIterator : public ZyrDbAreaGroupConstIterator {
public:
    explicit ZyrDbAreaGroupConstBackwardIterator(const HsDbObjectId& root);

    bool done() const override { return walk().done(); }
    void reset() override { walk().reset(); }
    ~ZyrDbAreaGroupConstBackwardIterator() override;

    const ZyrDbAreaGroup* operator->() const { return walk().operator->(); }
    const ZyrDbAreaGroup* operator*() const { return *walk(); }
    ZyrDbAreaGroupConstBackwardIterator& operator++() {
        ++walk();
        return *this;
    }

private:
    ZyrDbAreaGroupConstBackwardIteratorImp& walk() const;
};
