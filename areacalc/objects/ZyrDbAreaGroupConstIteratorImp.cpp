#include "areacalc/objects/ZyrDbAreaGroupConstIteratorImp.h"

#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <utility>

// ---- ZyrDbAreaGroupConstIteratorImp ----

ZyrDbAreaGroupConstIteratorImp::ZyrDbAreaGroupConstIteratorImp(const HsDbObjectId& root)
    : m_root(root) {}

// noexcept: a group that cannot be closed leaves the drawing in a state nobody can repair.
ZyrDbAreaGroupConstIteratorImp::~ZyrDbAreaGroupConstIteratorImp() {
    closeCurrent();
}

const ZyrDbAreaGroup* ZyrDbAreaGroupConstIteratorImp::open(const HsDbObjectId& id) const {
    static_cast<void>(ZyrDbAreaGroup::open(m_current, id, HsDb::kForRead));
    return m_current;
}

void ZyrDbAreaGroupConstIteratorImp::closeCurrent() const {
    if (ZyrDbAreaGroup* group = std::exchange(m_current, nullptr))
        static_cast<void>(group->close());
}

// ---- ZyrDbAreaGroupConstForwardIteratorImp ----

ZyrDbAreaGroupConstForwardIteratorImp::ZyrDbAreaGroupConstForwardIteratorImp(
    const HsDbObjectId& root)
    : ZyrDbAreaGroupConstIteratorImp(root) {
    m_stack.push_back(root);
}

ZyrDbAreaGroupConstForwardIteratorImp::~ZyrDbAreaGroupConstForwardIteratorImp() = default;

void ZyrDbAreaGroupConstForwardIteratorImp::reset() {
    closeCurrent();
    m_stack.clear();
    m_stack.push_back(root());
}

const ZyrDbAreaGroup* ZyrDbAreaGroupConstForwardIteratorImp::operator->() const {
    if (current() != nullptr)
        return current();
    if (m_stack.empty())
        return nullptr;
    return open(m_stack.back());
}

const ZyrDbAreaGroup* ZyrDbAreaGroupConstForwardIteratorImp::operator*() {
    if (current() != nullptr)
        return current();
    if (m_stack.empty())
        return nullptr;
    if (m_stack.back().isErased()) {
        m_stack.pop_back();
        return nullptr;
    }
    return open(m_stack.back());
}

ZyrDbAreaGroupConstForwardIteratorImp& ZyrDbAreaGroupConstForwardIteratorImp::operator++() {
    const ZyrDbAreaGroup* group = operator*();
    if (group == nullptr)
        return *this;
    const std::vector<HsDbObjectId> children = group->groupHandler()->nodes();
    closeCurrent();
    m_stack.pop_back();
    m_stack.insert(m_stack.end(), children.rbegin(), children.rend());
    return *this;
}

// ---- ZyrDbAreaGroupConstBackwardIteratorImp ----

ZyrDbAreaGroupConstBackwardIteratorImp::ZyrDbAreaGroupConstBackwardIteratorImp(
    const HsDbObjectId& root)
    : ZyrDbAreaGroupConstIteratorImp(root) {
    forEach<ZyrDbAreaGroupConstForwardIteratorImp>(root, ZyrAreaGroupCollectorVector(m_list));
    m_first = m_list.crbegin();
    m_position = m_first;
    m_last = m_list.crend();
}

ZyrDbAreaGroupConstBackwardIteratorImp::~ZyrDbAreaGroupConstBackwardIteratorImp() = default;

void ZyrDbAreaGroupConstBackwardIteratorImp::reset() {
    closeCurrent();
    m_position = m_first;
}

const ZyrDbAreaGroup* ZyrDbAreaGroupConstBackwardIteratorImp::operator->() const {
    if (current() != nullptr || done())
        return current();
    return open(*m_position);
}

ZyrDbAreaGroupConstBackwardIteratorImp& ZyrDbAreaGroupConstBackwardIteratorImp::operator++() {
    if (done())
        return *this;
    static_cast<void>(operator->());
    closeCurrent();
    ++m_position;
    return *this;
}

// ---- ZyrAreaGroupCollectorVector ----

void ZyrAreaGroupCollectorVector::operator()(const ZyrDbAreaGroup* group) {
    if (group == nullptr)
        throw HsAssertionViolation("a group to collect is erased or cannot be opened");
    m_ids.push_back(group->objectId());
}
