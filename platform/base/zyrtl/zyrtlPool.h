// Small records made in large numbers and freed together.
#pragma once

#include <cstddef>
#include <vector>

namespace zyrtl {

// Blocks of one size, cut one after the other from slabs. A freed block is the next one handed
// out. When the last block in use comes back, the pool starts cutting again from the front, so
// that the records of the next batch lie in the order they are made, however the last batch was
// freed. It keeps its first kSlabsKept slabs for that batch and gives the others back. Like the
// rest of the system, a pool is used from one thread.
class BlockPool {
public:
    // blockSize is rounded up to a multiple of kAlignment.
    explicit BlockPool(std::size_t blockSize);
    BlockPool(const BlockPool&) = delete;
    BlockPool& operator=(const BlockPool&) = delete;
    ~BlockPool();

    static constexpr std::size_t kAlignment = 16;
    static constexpr std::size_t kSlabSize = std::size_t{64} * 1024;
    static constexpr std::size_t kSlabsKept = 32;

    void* allocate();
    // block must have come from this pool and be in use.
    void deallocate(void* block) noexcept;

    std::size_t blockSize() const { return m_blockSize; }
    std::size_t blocksInUse() const { return m_inUse; }
    std::size_t slabCount() const { return m_slabs.size(); }

private:
    struct FreeBlock {
        FreeBlock* next;
    };

    void* cutFromSlab();
    void startOver() noexcept;

    std::size_t m_blockSize;
    FreeBlock* m_free = nullptr;
    // The part of the slab being cut that is not cut yet.
    char* m_next = nullptr;
    char* m_end = nullptr;
    std::vector<char*> m_slabs;
    // The slabs before it have been cut whole.
    std::size_t m_nextSlab = 0;
    std::size_t m_inUse = 0;
};

// A block from the pool of its rounded size, shared by every record of that size; sizes
// above kLargestPooled go to the global operator new. freeBlock takes the size it was made with.
constexpr std::size_t kLargestPooled = 256;
void* allocateBlock(std::size_t size);
void freeBlock(void* block, std::size_t size) noexcept;

} // namespace zyrtl

// In the body of a plain record of which a calculation makes one or more per object: its new and
// delete, and those of the classes derived from it, go to the pools. Unlike a base class, the
// macro leaves the record an aggregate.
#define ZYRTL_POOLED_RECORD                                                                        \
    static void* operator new(std::size_t size) {                                                  \
        return zyrtl::allocateBlock(size);                                                         \
    }                                                                                              \
    static void operator delete(void* block, std::size_t size) noexcept {                          \
        zyrtl::freeBlock(block, size);                                                             \
    }
