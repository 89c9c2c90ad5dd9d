// Pools of small blocks for the records a calculation makes in large numbers.
#include "platform/base/zyrtl/zyrtlPool.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <set>
#include <vector>

namespace {

bool aligned(const void* block) {
    return reinterpret_cast<std::uintptr_t>(block) % zyrtl::BlockPool::kAlignment == 0;
}

TEST(zyrtlBlockPool, blocksAreRoundedAlignedAndDistinctAndAFreedBlockIsHandedOutNext) {
    EXPECT_EQ(zyrtl::BlockPool(1).blockSize(), 16u);
    zyrtl::BlockPool pool(40);
    ASSERT_EQ(pool.blockSize(), 48u);
    std::set<char*> blocks;
    for (int i = 0; i < 5; ++i) {
        auto* block = static_cast<char*>(pool.allocate());
        ASSERT_TRUE(aligned(block));
        for (char* other : blocks)
            ASSERT_GE(block > other ? block - other : other - block, 48);
        blocks.insert(block);
    }
    char* middle = *std::next(blocks.begin(), 2);
    pool.deallocate(middle);
    EXPECT_EQ(pool.blocksInUse(), 4u);
    EXPECT_EQ(pool.allocate(), middle);
    for (char* block : blocks)
        pool.deallocate(block);
}

TEST(zyrtlBlockPool, whenTheLastBlockComesBackThePoolStartsAtTheFrontAndKeepsItsFirstSlabs) {
    zyrtl::BlockPool pool(zyrtl::BlockPool::kSlabSize / 4);
    const size_t blocksMade = 4 * (zyrtl::BlockPool::kSlabsKept + 3);
    std::vector<void*> blocks;
    for (size_t i = 0; i < blocksMade; ++i)
        blocks.push_back(pool.allocate());
    ASSERT_EQ(pool.slabCount(), zyrtl::BlockPool::kSlabsKept + 3);

    // While a block is in use, the last one freed is the next one handed out.
    const size_t last = blocks.size() - 1;
    for (size_t i = 0; i < last; ++i)
        pool.deallocate(blocks[i]);
    EXPECT_EQ(pool.allocate(), blocks[last - 1]);
    pool.deallocate(blocks[last - 1]);
    pool.deallocate(blocks[last]);
    EXPECT_EQ(pool.blocksInUse(), 0u);
    EXPECT_EQ(pool.slabCount(), zyrtl::BlockPool::kSlabsKept);

    // A new batch is cut in order from the first slab again.
    EXPECT_EQ(pool.allocate(), blocks[0]);
    EXPECT_EQ(pool.allocate(), blocks[1]);
    EXPECT_EQ(pool.allocate(), blocks[2]);
}

struct Record {
    ZYRTL_POOLED_RECORD

    virtual ~Record() = default;
    double value = 0.0;
};

struct LargerRecord : Record {
    double more[8] = {};
};

struct HugeRecord : Record {
    char bytes[zyrtl::kLargestPooled] = {};
};

TEST(zyrtlPooledRecord, aDerivedRecordDeletedThroughItsBaseGoesBackToThePoolOfItsOwnSize) {
    static_assert(sizeof(LargerRecord) / zyrtl::BlockPool::kAlignment !=
                  sizeof(Record) / zyrtl::BlockPool::kAlignment);
    auto* keepBasePoolBusy = new Record;
    auto* keepLargerPoolBusy = new LargerRecord;
    Record* larger = new LargerRecord;
    const void* block = larger;
    delete larger;
    auto* record = new Record;
    EXPECT_NE(static_cast<void*>(record), block);
    auto* again = new LargerRecord;
    EXPECT_EQ(static_cast<void*>(again), block);

    // Too large for a pool: made and freed by the global operator new and delete.
    Record* huge = new HugeRecord;
    for (Record* made : {keepBasePoolBusy, static_cast<Record*>(keepLargerPoolBusy), record,
                         static_cast<Record*>(again), huge})
        delete made;
}

#if defined(__SANITIZE_ADDRESS__)
TEST(zyrtlPooledRecordDeathTest, aRecordUsedAfterItsDeleteIsCaughtByTheAddressSanitizer) {
    auto* keepPoolBusy = new Record;
    auto* record = new Record;
    volatile double* value = &record->value;
    delete record;
    EXPECT_DEATH(*value = 1.0, "use-after-poison");
    delete keepPoolBusy;
}
#endif

} // namespace
