#include "foundation/cow_COW.h"

#include "tests/foundation/Tracked.h"

#include <gtest/gtest.h>

#include <memory>
#include <utility>

namespace {

class Shape {
public:
    virtual ~Shape() = default;
    virtual Shape* Copy() const = 0;
    virtual int Corners() const = 0;
};

class Polygon final : public Shape {
public:
    explicit Polygon(int corners) : corners_(corners) {}
    Polygon* Copy() const override { return new Polygon(*this); }
    int Corners() const override { return corners_; }

private:
    int corners_;
};

using Handle = cow_CountedHld<Tracked>;
using Direct = cow_COW<Tracked, cow_Direct<Tracked>>;
using ShapeItem = cow_ArrayCOW<Shape, cow_Virtual<Shape>>;

class cow_HandleTest : public ::testing::Test {
protected:
    void SetUp() override { Tracked::Reset(); }
    void TearDown() override { EXPECT_EQ(Tracked::alive, 0); }
};
using cow_CountedHldTest = cow_HandleTest;
using cow_COWTest = cow_HandleTest;
using cow_ArrayCOWTest = cow_HandleTest;

TEST(cow_Counter, Decremented_TellsWhenItFallsToZero) {
    cow_Counter count;
    count.Increment();
    EXPECT_EQ(count.Count(), 2);
    EXPECT_FALSE(count.Decrement());
    EXPECT_TRUE(count.Decrement());
}

TEST_F(cow_CountedHldTest, DefaultConstructed_IsNull) {
    const Handle handle;
    EXPECT_TRUE(handle.IsNull());
    EXPECT_EQ(handle.Referent(), nullptr);
    EXPECT_EQ(handle.HolderCount(), 0);
}

TEST_F(cow_CountedHldTest, NullReferent_IsAllowed) {
    const Handle handle(nullptr);
    const Handle copy(handle);
    EXPECT_TRUE(copy.IsNull());
    EXPECT_TRUE(copy == handle);
}

TEST_F(cow_CountedHldTest, Copied_SharesReferentUntilLastHolderGoes) {
    auto first = std::make_unique<Handle>(new Tracked(5));
    auto second = std::make_unique<Handle>(*first);
    EXPECT_EQ(first->Referent(), second->Referent());
    EXPECT_EQ(first->HolderCount(), 2);
    first.reset();
    EXPECT_EQ(Tracked::alive, 1);
    EXPECT_EQ((*second)->Value(), 5);
    EXPECT_EQ(second->HolderCount(), 1);
    second.reset();
    EXPECT_EQ(Tracked::alive, 0);
}

TEST_F(cow_CountedHldTest, Assigned_DropsOldReferent) {
    Handle a(new Tracked(1));
    const Handle b(new Tracked(2));
    a = b;
    EXPECT_EQ(Tracked::destroyed, std::vector<int>{1});
    EXPECT_EQ(a->Value(), 2);
}

TEST_F(cow_CountedHldTest, AssignedToItself_KeepsReferent) {
    Handle a(new Tracked(1));
    const Handle& alias = a;
    a = alias;
    EXPECT_EQ((*a).Value(), 1);
    EXPECT_EQ(a.HolderCount(), 1);
}

TEST_F(cow_CountedHldTest, Moved_LeavesNull) {
    Handle a(new Tracked(1));
    const Handle b(std::move(a));
    EXPECT_TRUE(a.IsNull()); // NOLINT(bugprone-use-after-move)
    EXPECT_EQ(b.HolderCount(), 1);
}

TEST_F(cow_CountedHldTest, Reset_TakesNewReferentForThisHandleOnly) {
    Handle a(new Tracked(1));
    const Handle b(a);
    a.Reset(new Tracked(2));
    EXPECT_EQ(a->Value(), 2);
    EXPECT_EQ(b->Value(), 1);
    EXPECT_FALSE(a == b);
}

TEST_F(cow_COWTest, WrittenAlone_IsNotCopied) {
    Direct handle(new Tracked(1));
    const Tracked* before = &handle.ConstGet();
    EXPECT_EQ(&handle.Get(), before);
}

TEST_F(cow_COWTest, WrittenWhileShared_CopiesAndLeavesTheOther) {
    Direct a(new Tracked(1));
    const Direct b(a);
    a.Get() = Tracked(2);
    EXPECT_EQ(a.ConstGet().Value(), 2);
    EXPECT_EQ(b.ConstGet().Value(), 1);
    EXPECT_EQ(a.HolderCount(), 1);
    EXPECT_EQ(b.HolderCount(), 1);
}

TEST_F(cow_COWTest, CopyFails_BothHandlesStayShared) {
    Direct a(new Tracked(1));
    const Direct b(a);
    Tracked::fuse = 0;
    EXPECT_THROW(a.Get(), std::runtime_error);
    EXPECT_EQ(&a.ConstGet(), &b.ConstGet());
    EXPECT_EQ(a.HolderCount(), 2);
}

TEST_F(cow_ArrayCOWTest, MadeFromObject_StoresItsVirtualCopy) {
    const Polygon triangle(3);
    const ShapeItem item(triangle);
    EXPECT_NE(&item.ConstGet(), &triangle);
    EXPECT_EQ(item.ConstGet().Corners(), 3);
    EXPECT_NE(dynamic_cast<const Polygon*>(&item.ConstGet()), nullptr);
}

TEST_F(cow_ArrayCOWTest, WrittenWhileShared_CopiesVirtually) {
    ShapeItem item(Polygon(4));
    const ShapeItem other(item);
    EXPECT_EQ(&item.ConstGet(), &other.ConstGet());
    EXPECT_NE(&item.Get(), &other.ConstGet());
    EXPECT_EQ(item.ConstGet().Corners(), 4);
}

} // namespace
