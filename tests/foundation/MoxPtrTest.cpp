#include "foundation/common/MoxPtr.h"

#include "foundation/common/MoxRCObject.h"

#include <gtest/gtest.h>

namespace {

using MoxCommonNS::MoxPtr;
using MoxCommonNS::MoxRCObject;

class Probe : public MoxRCObject {
public:
    explicit Probe(int& count) : deaths(count) {}

    ~Probe() override { ++deaths; }

private:
    int& deaths;
};

class DerivedProbe : public Probe {
public:
    using Probe::Probe;
};

class MoxPtrTest : public testing::Test {
protected:
    int deaths = 0;
    int otherDeaths = 0;
    MoxPtr<Probe> pointer = new Probe(deaths);
};

TEST_F(MoxPtrTest, TheFirstPointerTakesTheCountToOne) {
    EXPECT_EQ(pointer->getReferenceCount(), 1);
    EXPECT_EQ((*pointer).getReferenceCount(), 1);
}

TEST_F(MoxPtrTest, ACopyCounts) {
    {
        const MoxPtr<Probe> copy(pointer);
        EXPECT_EQ(copy.get(), pointer.get());
        EXPECT_EQ(pointer->getReferenceCount(), 2);
    }
    EXPECT_EQ(pointer->getReferenceCount(), 1);
    EXPECT_EQ(deaths, 0);
}

TEST_F(MoxPtrTest, AMoveDoesNotCountAndLeavesNull) {
    MoxPtr<Probe> moved(std::move(pointer));
    EXPECT_EQ(moved->getReferenceCount(), 1);
    // NOLINTNEXTLINE(bugprone-use-after-move,clang-analyzer-cplusplus.Move): the claim
    EXPECT_TRUE(pointer == nullptr);
    MoxPtr<Probe> again;
    again = std::move(moved);
    EXPECT_EQ(again->getReferenceCount(), 1);
    // NOLINTNEXTLINE(bugprone-use-after-move,clang-analyzer-cplusplus.Move): the claim
    EXPECT_TRUE(moved == nullptr);
}

TEST_F(MoxPtrTest, AssigningItsOwnTargetLeavesTheCountUnchanged) {
    pointer = pointer.get();
    EXPECT_EQ(pointer->getReferenceCount(), 1);
    const MoxPtr<Probe>& same = pointer;
    pointer = same;
    EXPECT_EQ(pointer->getReferenceCount(), 1);
    EXPECT_EQ(deaths, 0);
}

TEST_F(MoxPtrTest, AssignmentLetsTheOldTargetGo) {
    pointer = new Probe(otherDeaths);
    EXPECT_EQ(deaths, 1);
    pointer = MoxPtr<Probe>();
    EXPECT_EQ(otherDeaths, 1);
}

TEST_F(MoxPtrTest, DestructionLetsTheTargetGo) {
    { const MoxPtr<Probe> other(new Probe(otherDeaths)); }
    EXPECT_EQ(otherDeaths, 1);
}

TEST_F(MoxPtrTest, NullIsAllowedEverywhere) {
    MoxPtr<Probe> null;
    const MoxPtr<Probe> copy(null);
    const MoxPtr<Probe> fromNull(nullptr);
    null = copy;
    null = nullptr;
    MoxPtr<Probe>& same = null;
    null = std::move(same);
    null.swap(same);
    EXPECT_FALSE(null);
    EXPECT_EQ(null, fromNull);
    EXPECT_EQ(null.get(), nullptr);
    pointer = nullptr;
    EXPECT_EQ(deaths, 1);
    EXPECT_EQ(pointer, null);
}

TEST_F(MoxPtrTest, HoldsAnObjectOfADerivedClass) {
    int derivedDeaths = 0;
    const MoxPtr<DerivedProbe> derived(new DerivedProbe(derivedDeaths));
    {
        const MoxPtr<Probe> base(derived);
        EXPECT_EQ(base.get(), derived.get());
        EXPECT_EQ(derived->getReferenceCount(), 2);
    }
    EXPECT_EQ(derived->getReferenceCount(), 1);
}

TEST_F(MoxPtrTest, ComparesTargets) {
    const MoxPtr<Probe> copy(pointer);
    const MoxPtr<Probe> other(new Probe(otherDeaths));
    EXPECT_TRUE(copy == pointer);
    EXPECT_FALSE(other == pointer);
    EXPECT_TRUE(pointer == copy.get());
    EXPECT_TRUE(pointer != nullptr);
}

TEST_F(MoxPtrTest, SwapExchangesTargetsWithoutCounting) {
    MoxPtr<Probe> other(new Probe(otherDeaths));
    const Probe* first = pointer.get();
    pointer.swap(other);
    EXPECT_EQ(other.get(), first);
    EXPECT_EQ(first->getReferenceCount(), 1);
    EXPECT_EQ(deaths + otherDeaths, 0);
}

} // namespace
