#include "areacalc/objects/ZyrDbAreaGroupConstIterator.h"

ZyrDbAreaGroupConstIterator::~ZyrDbAreaGroupConstIterator() {
    delete m_imp;
}

ZyrDbAreaGroupConstForwardIterator::ZyrDbAreaGroupConstForwardIterator(const HsDbObjectId& root)
    : ZyrDbAreaGroupConstIterator(new ZyrDbAreaGroupConstForwardIteratorImp(root)) {}

ZyrDbAreaGroupConstForwardIterator::~ZyrDbAreaGroupConstForwardIterator() = default;

// The implementation was made by the constructor, of the class that goes with the iterator's.
ZyrDbAreaGroupConstForwardIteratorImp& ZyrDbAreaGroupConstForwardIterator::walk() const {
    return *static_cast<ZyrDbAreaGroupConstForwardIteratorImp*>(heldImp());
}

ZyrDbAreaGroupConstBackwardIterator::ZyrDbAreaGroupConstBackwardIterator(const HsDbObjectId& root)
    : ZyrDbAreaGroupConstIterator(new ZyrDbAreaGroupConstBackwardIteratorImp(root)) {}

ZyrDbAreaGroupConstBackwardIterator::~ZyrDbAreaGroupConstBackwardIterator() = default;

ZyrDbAreaGroupConstBackwardIteratorImp& ZyrDbAreaGroupConstBackwardIterator::walk() const {
    return *static_cast<ZyrDbAreaGroupConstBackwardIteratorImp*>(heldImp());
}
