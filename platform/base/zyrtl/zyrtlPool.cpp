#include "platform/base/zyrtl/zyrtlPool.h"

#include <sanitizer/asan_interface.h>

#include <array>
#include <memory>
#include <new>

namespace zyrtl {

namespace {

constexpr std::size_t roundedUp(std::size_t size) {
    return (size + BlockPool::kAlignment - 1) / BlockPool::kAlignment * BlockPool::kAlignment;
}

} // namespace

// Free blocks and the uncut rest of a slab are poisoned for the address sanitizer, so that a record
// used after its delete is caught as it would be without the pool.
BlockPool::BlockPool(std::size_t blockSize)
    : m_blockSize(roundedUp(blockSize < sizeof(FreeBlock) ? sizeof(FreeBlock) : blockSize)) {}

BlockPool::~BlockPool() {
    for (char* slab : m_slabs) {
        ASAN_UNPOISON_MEMORY_REGION(slab, kSlabSize);
        ::operator delete (slab, std::align_val_t{kAlignment});
    }
}

void* BlockPool::allocate() {
    void* block = nullptr;
    if (m_free != nullptr) {
        ASAN_UNPOISON_MEMORY_REGION(m_free, m_blockSize);
        block = m_free;
        m_free = m_free->next;
    } else {
        block = cutFromSlab();
    }
    ++m_inUse;
    return block;
}

void* BlockPool::cutFromSlab() {
    if (static_cast<std::size_t>(m_end - m_next) < m_blockSize) {
        if (m_nextSlab == m_slabs.size()) {
            auto* slab =
                static_cast<char*>(::operator new (kSlabSize, std::align_val_t{kAlignment}));
            ASAN_POISON_MEMORY_REGION(slab, kSlabSize);
            m_slabs.push_back(slab);
        }
        m_next = m_slabs[m_nextSlab++];
        m_end = m_next + kSlabSize;
    }
    char* block = m_next;
    m_next += m_blockSize;
    ASAN_UNPOISON_MEMORY_REGION(block, m_blockSize);
    return block;
}

void BlockPool::deallocate(void* block) noexcept {
    auto* freed = static_cast<FreeBlock*>(block);
    freed->next = m_free;
    m_free = freed;
    ASAN_POISON_MEMORY_REGION(block, m_blockSize);
    if (--m_inUse == 0)
        startOver();
}

void BlockPool::startOver() noexcept {
    while (m_slabs.size() > kSlabsKept) {
        ASAN_UNPOISON_MEMORY_REGION(m_slabs.back(), kSlabSize);
        ::operator delete (m_slabs.back(), std::align_val_t{kAlignment});
        m_slabs.pop_back();
    }
    // Every block is free now, and so poisoned again, as is every part not cut.
    m_free = nullptr;
    m_nextSlab = 0;
    m_next = nullptr;
    m_end = nullptr;
}

namespace {

constexpr std::size_t kPoolCount = kLargestPooled / BlockPool::kAlignment;

// Never destroyed: a record may be deleted by another object's static destructor at exit.
std::array<std::unique_ptr<BlockPool>, kPoolCount>& pools() {
    static auto* all = new std::array<std::unique_ptr<BlockPool>, kPoolCount>;
    return *all;
}

BlockPool& poolFor(std::size_t size) {
    const std::size_t slot = (size == 0 ? 0 : (size - 1) / BlockPool::kAlignment);
    std::unique_ptr<BlockPool>& pool = pools()[slot];
    if (pool == nullptr)
        pool = std::make_unique<BlockPool>(size);
    return *pool;
}

} // namespace

void* allocateBlock(std::size_t size) {
    if (size > kLargestPooled)
        return ::operator new(size);
    return poolFor(size).allocate();
}

void freeBlock(void* block, std::size_t size) noexcept {
    if (block == nullptr)
        return;
    if (size > kLargestPooled)
        ::operator delete(block);
    else
        poolFor(size).deallocate(block);
}

} // namespace zyrtl
