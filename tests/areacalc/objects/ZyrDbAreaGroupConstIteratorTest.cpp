// Walks over a tree of area groups: the forward and backward orders, reset, forEach, and groups
// that are erased or cannot be opened.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/objects/ZyrDbAreaGroupConstIterator.h"
#include "platform/host/ut/HsAssertionViolation.h"

namespace {

using Names = std::vector<std::wstring>;

// root holds K and L; K holds M.
class ZyrAreaGroupWalks : public ZyrAreaDrawing {
protected:
    void SetUp() override {
        ZyrAreaDrawing::SetUp();
        M = addGroup(L"M");
        K = addGroup(L"K", {M});
        L = addGroup(L"L");
        root = addGroup(L"root", {K, L});
    }

    // What a walk hands out until done, a null as "-". A null from an erased group was passed
    // over already, so the walk goes on without a step; a second null in a row is a group that
    // cannot be opened, where a caller must break off.
    template <class Iterator> static Names walk(Iterator& it) {
        Names seen;
        bool afterNull = false;
        while (!it.done()) {
            const ZyrDbAreaGroup* group = *it;
            if (group == nullptr && afterNull)
                break;
            afterNull = group == nullptr;
            seen.push_back(group != nullptr ? group->name().str() : L"-");
            if (group != nullptr)
                ++it;
        }
        return seen;
    }
    template <class Iterator> static Names walkFrom(const HsDbObjectId& id) {
        Iterator it(id);
        return walk(it);
    }

    HsDbObjectId M, K, L, root;
};

// Reset reads the tree again going forward, but not going backward.
TEST_F(ZyrAreaGroupWalks, forwardGoesParentsFirstAndBackwardTheExactReverse) {
    EXPECT_EQ(walkFrom<ZyrDbAreaGroupConstForwardIterator>(M), Names{L"M"});
    EXPECT_EQ(walkFrom<ZyrDbAreaGroupConstBackwardIterator>(M), Names{L"M"});
    Ids collected;
    forEach<ZyrDbAreaGroupConstForwardIteratorImp>(root, ZyrAreaGroupCollectorVector(collected));
    EXPECT_EQ(collected, (Ids{root, K, M, L}));
    ZyrDbAreaGroupConstForwardIterator forward(root);
    ZyrDbAreaGroupConstBackwardIterator backward(root);
    EXPECT_EQ(walk(forward), (Names{L"root", L"K", L"M", L"L"}));
    EXPECT_EQ(walk(backward), (Names{L"L", L"M", L"K", L"root"}));
    ASSERT_EQ(HsDbObjectPointer<ZyrDbAreaGroup>(L, HsDb::kForWrite)
                  ->groupHandler()
                  ->addNode(addGroup(L"N")),
              Hsys::eSuccess);
    forward.reset();
    backward.reset();
    EXPECT_EQ(walk(forward), (Names{L"root", L"K", L"M", L"L", L"N"}));
    EXPECT_EQ(walk(backward), (Names{L"L", L"M", L"K", L"root"}));
}

TEST_F(ZyrAreaGroupWalks, anErasedGroupIsSeenOnceAsNullAndNotDescendedInto) {
    erase(K);
    EXPECT_EQ(walkFrom<ZyrDbAreaGroupConstForwardIterator>(root), (Names{L"root", L"-", L"L"}));
    Ids collected;
    EXPECT_THROW(forEach<ZyrDbAreaGroupConstForwardIteratorImp>(
                     root, ZyrAreaGroupCollectorVector(collected)),
                 HsAssertionViolation)
        << "its callers give it trees without erased groups";
    EXPECT_EQ(collected, Ids{root});
    EXPECT_THROW(ZyrDbAreaGroupConstBackwardIterator{root}, HsAssertionViolation);
}

TEST_F(ZyrAreaGroupWalks, aGroupThatCannotBeOpenedStopsTheWalkWhereItIs) {
    HsDbObjectPointer<ZyrDbAreaGroup> held(K, HsDb::kForWrite);
    ZyrDbAreaGroupConstForwardIterator it(root);
    EXPECT_EQ(walk(it), (Names{L"root", L"-"}));
    EXPECT_FALSE(it.done());
    ++it;
    EXPECT_EQ(*it, nullptr) << "the step did nothing";
    held.close();
    EXPECT_EQ(walk(it), (Names{L"K", L"M", L"L"}));
}

TEST_F(ZyrAreaGroupWalks, onlyTheGroupHandedOutIsOpenUntilTheNextStep) {
    const auto writable = [](const HsDbObjectId& id) {
        return HsDbObjectPointer<ZyrDbAreaGroup>(id, HsDb::kForWrite).openStatus() ==
               Hsys::eSuccess;
    };
    {
        ZyrDbAreaGroupConstForwardIterator forward(root);
        ZyrDbAreaGroupConstBackwardIterator backward(root);
        EXPECT_EQ(std::pair(forward->name().str(), backward->name().str()),
                  std::pair(std::wstring(L"root"), std::wstring(L"L")));
        EXPECT_EQ(std::pair(writable(root), writable(L)), std::pair(false, false));
        ++forward;
        ++backward;
        EXPECT_EQ(std::pair(writable(root), writable(L)), std::pair(true, true));
        EXPECT_EQ(std::pair((*forward)->name().str(), (*backward)->name().str()),
                  std::pair(std::wstring(L"K"), std::wstring(L"M")));
    }
    EXPECT_EQ(std::pair(writable(K), writable(M)), std::pair(true, true))
        << "closed by the iterators' end";
}

} // namespace
