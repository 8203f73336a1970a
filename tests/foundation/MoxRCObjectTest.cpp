#include "foundation/common/MoxRCObject.h"

#include <gtest/gtest.h>
#include <thread>

namespace {

using MoxCommonNS::MoxRCObject;

class Probe : public MoxRCObject {
public:
    explicit Probe(int& count) : deaths(count) {}

    ~Probe() override { ++deaths; }

private:
    int& deaths;
};

TEST(MoxRCObject, StartsAtZero) { EXPECT_EQ(MoxRCObject().getReferenceCount(), 0); }

TEST(MoxRCObject, DiesWhenTheCountFallsBelowOne) {
    int deaths = 0;
    auto* probe = new Probe(deaths);
    probe->addRef();
    probe->addRef();
    EXPECT_EQ(probe->getReferenceCount(), 2);
    probe->release();
    EXPECT_EQ(probe->getReferenceCount(), 1);
    EXPECT_EQ(deaths, 0);
    probe->release();
    EXPECT_EQ(deaths, 1);
}

TEST(MoxRCObject, ReleaseWithoutAnyReferenceDeletesToo) {
    int deaths = 0;
    const auto* probe = new Probe(deaths);
    probe->release();
    EXPECT_EQ(deaths, 1);
}

TEST(MoxRCObject, ReleaseWithoutDeleteTellsThatNobodyIsLeft) {
    int deaths = 0;
    const Probe probe(deaths);
    probe.addRef();
    probe.addRef();
    EXPECT_FALSE(probe.releaseWithoutDelete());
    EXPECT_TRUE(probe.releaseWithoutDelete());
    EXPECT_EQ(deaths, 0);
}

TEST(MoxRCObject, TwoThreadsCountTogether) {
    constexpr int rounds = 100000;
    int deaths = 0;
    const auto* probe = new Probe(deaths);
    probe->addRef();
    const auto use = [probe] {
        for (int i = 0; i < rounds; ++i) {
            probe->addRef();
            probe->release();
        }
    };
    std::thread one(use);
    std::thread other(use);
    one.join();
    other.join();
    EXPECT_EQ(probe->getReferenceCount(), 1);
    EXPECT_EQ(deaths, 0);
    probe->release();
    EXPECT_EQ(deaths, 1);
}

} // namespace
