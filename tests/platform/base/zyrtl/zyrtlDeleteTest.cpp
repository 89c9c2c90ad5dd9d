// Deleting owned pointers held in containers.
#include "platform/base/zyrtl/zyrtlDelete.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <deque>
#include <vector>

namespace {

struct Counted {
    explicit Counted(int& alive) : m_alive(alive) { ++m_alive; }
    ~Counted() { --m_alive; }
    int& m_alive;
};

TEST(zyrtlDelete, deleteItemsEmptiesTheContainerAndDeleteItemServesRemoveIfBothSkippingNull) {
    int alive = 0;
    std::deque<Counted*> queue{new Counted(alive), nullptr, new Counted(alive)};
    zyrtl::deleteItems(queue);
    EXPECT_TRUE(queue.empty());
    std::vector<Counted*> items{new Counted(alive), nullptr, new Counted(alive)};
    ASSERT_EQ(alive, 2);
    std::erase_if(items, zyrtl::deleteItem<Counted*>());
    EXPECT_EQ(alive, 0);
    EXPECT_TRUE(items.empty());
}

} // namespace
