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

TEST(zyrtlDelete, deleteItemsDeletesEveryPointerAndEmptiesTheContainer) {
    int alive = 0;
    std::deque<Counted*> items{new Counted(alive), nullptr, new Counted(alive)};
    ASSERT_EQ(alive, 2);
    zyrtl::deleteItems(items);
    EXPECT_EQ(alive, 0);
    EXPECT_TRUE(items.empty());
}

TEST(zyrtlDelete, deleteItemServesRemoveIfAndSkipsNull) {
    int alive = 0;
    std::vector<Counted*> items{new Counted(alive), nullptr, new Counted(alive)};
    items.erase(std::remove_if(items.begin(), items.end(), zyrtl::deleteItem<Counted*>()), items.end());
    EXPECT_EQ(alive, 0);
    EXPECT_TRUE(items.empty());
}

} // namespace
