// The walks behind the area group iterators: depth first from a root group, parents before
// children, and the exact reverse of that order; each group handed out opened for read.
#pragma once

#include "platform/host/db/HsDbObjectId.h"

#include <deque>
#include <vector>

class ZyrDbAreaGroup;

// At most one group is open at a time, from the first access to the next step, reset or the end of
// the walk. The root id is kept by reference: the caller's id must outlive the walk. A group that
// cannot be opened shows as null and no status is given.
class ZyrDbAreaGroupConstIteratorImp {
public:
    explicit ZyrDbAreaGroupConstIteratorImp(const HsDbObjectId& root);
    ZyrDbAreaGroupConstIteratorImp(const ZyrDbAreaGroupConstIteratorImp&) = delete;
    ZyrDbAreaGroupConstIteratorImp& operator=(const ZyrDbAreaGroupConstIteratorImp&) = delete;

    // The virtual operations, in the order of their slots.
    virtual bool done() const = 0;
    virtual void reset() = 0;
    // Closes the open group; a failure there ends the process.
    virtual ~ZyrDbAreaGroupConstIteratorImp();

protected:
    const HsDbObjectId& root() const { return m_root; }
    const ZyrDbAreaGroup* current() const { return m_current; }
    // Opens id for read as the current group; null when the open fails.
    const ZyrDbAreaGroup* open(const HsDbObjectId& id) const;
    void closeCurrent() const;

private:
    // Opened lazily by the const accessors.
    mutable ZyrDbAreaGroup* m_current = nullptr;
    const HsDbObjectId& m_root;
};

// Parents before children, the children of a group in the order of its nodes. The stack holds
// every sibling still due, not only the path.
//
// An erased group is seen once as null through operator*, which passes over it; its children are
// not visited. A group that cannot be opened (open for write elsewhere) stays on the stack: step
// does nothing while no group is open, so a caller looping on done() breaks off at a null that
// isErased() does not explain.
class ZyrDbAreaGroupConstForwardIteratorImp : public ZyrDbAreaGroupConstIteratorImp {
public:
    explicit ZyrDbAreaGroupConstForwardIteratorImp(const HsDbObjectId& root);

    bool done() const override { return m_stack.empty(); }
    // Back to the root; the children are read again as the walk comes to them.
    void reset() override;
    ~ZyrDbAreaGroupConstForwardIteratorImp() override;

    // The group on top, opened; null for an empty stack or a failed open. Erased ids are opened
    // like any other (and fail).
    const ZyrDbAreaGroup* operator->() const;
    // The same, but an erased group on top is popped and null given.
    const ZyrDbAreaGroup* operator*();
    // Replaces the group on top by its child groups, erased ones included, the first on top.
    ZyrDbAreaGroupConstForwardIteratorImp& operator++();

private:
    std::deque<HsDbObjectId> m_stack;
};

// The reverse of the forward order, children before parents, collected once at construction:
// later changes of the tree are not seen, and reset restarts the same list. The tree must hold no
// erased group (see forEach).
class ZyrDbAreaGroupConstBackwardIteratorImp : public ZyrDbAreaGroupConstIteratorImp {
public:
    explicit ZyrDbAreaGroupConstBackwardIteratorImp(const HsDbObjectId& root);

    bool done() const override { return m_position == m_last; }
    void reset() override;
    ~ZyrDbAreaGroupConstBackwardIteratorImp() override;

    // The group at the position, opened; null when the open fails.
    const ZyrDbAreaGroup* operator->() const;
    const ZyrDbAreaGroup* operator*() const { return operator->(); }
    // Closes the group at the position, opening it first if needed, and steps on.
    ZyrDbAreaGroupConstBackwardIteratorImp& operator++();

private:
    using Position = std::vector<HsDbObjectId>::const_reverse_iterator;

    std::vector<HsDbObjectId> m_list;
    Position m_position;
    Position m_first;
    Position m_last;
};

// Appends the id of each group it is given.
class ZyrAreaGroupCollectorVector {
public:
    explicit ZyrAreaGroupCollectorVector(std::vector<HsDbObjectId>& ids) : m_ids(ids) {}

    // A null group (erased, or not to be opened) is a caller's error: HsAssertionViolation. Left
    // to go on, the forward walk would stand on a group it cannot open for ever.
    void operator()(const ZyrDbAreaGroup* group);

private:
    std::vector<HsDbObjectId>& m_ids;
};

// Gives each group below root, root first, to collector in the forward order and returns it. The
// collector is given null for a group that is erased or cannot be opened: the callers give it
// trees without such groups.
template <class Imp, class Collector>
Collector forEach(const HsDbObjectId& root, Collector collector) {
    Imp walk(root);
    while (!walk.done()) {
        collector(*walk);
        ++walk;
    }
    return collector;
}
