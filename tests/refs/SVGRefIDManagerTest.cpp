#include "refs/SVGRefIDManager.h"

#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;

namespace {

using Manager = SVGRefIDManager;

constexpr Manager::SVGRefType unlisted[] = {
    static_cast<Manager::SVGRefType>(-1),
    static_cast<Manager::SVGRefType>(6),
    static_cast<Manager::SVGRefType>(1000),
};

std::string create(Manager& manager, Manager::SVGRefType type) {
    return utf8(manager.createReferenceID(type));
}

int number(Manager::SVGRefType type, const char16_t* id) {
    return Manager::getReferenceNumber(type, id);
}

} // namespace

TEST(SVGRefIDManager, EachKindHasItsPrefix) {
    struct Row {
        int type;
        const char* prefix;
    };

    constexpr Row rows[] = {{0, "p"}, {1, "t"}, {2, "g"}, {3, "m"}, {4, "c"}, {5, "i"}};
    for (const Row& row : rows) {
        const auto type = static_cast<Manager::SVGRefType>(row.type);
        EXPECT_EQ(utf8(Manager::getReferencePrefix(type)), row.prefix) << row.type;
    }
}

TEST(SVGRefIDManager, UnlistedKindHasItsPrefixToo) {
    for (const Manager::SVGRefType type : unlisted) {
        EXPECT_EQ(utf8(Manager::getReferencePrefix(type)), "xxx");
    }
}

TEST(SVGRefIDManager, NameIsPrefixAndNumber) {
    EXPECT_EQ(utf8(Manager::getReferenceName(Manager::REFPAGE, 12)), "p12");
    EXPECT_EQ(utf8(Manager::getReferenceName(Manager::REFCLIP, 0)), "c0");
    EXPECT_EQ(utf8(Manager::getReferenceName(Manager::REFIMAGE, -3)), "i-3");
    EXPECT_EQ(utf8(Manager::getReferenceName(unlisted[0], 7)), "xxx7");
}

TEST(SVGRefIDManager, EachKindCountsFromZero) {
    Manager manager;
    EXPECT_EQ(create(manager, Manager::REFCLIP), "c0");
    EXPECT_EQ(create(manager, Manager::REFPATTERN), "t0");
    EXPECT_EQ(create(manager, Manager::REFGRADIENT), "g0");
    EXPECT_EQ(create(manager, Manager::REFGRADIENT), "g1");
    EXPECT_EQ(create(manager, Manager::REFIMAGE), "i0");
    EXPECT_EQ(create(manager, Manager::REFIMAGE), "i1");
    EXPECT_EQ(create(manager, Manager::REFCLIP), "c1");
    EXPECT_EQ(create(manager, Manager::REFRESERVED), "m0");
    EXPECT_EQ(create(manager, Manager::REFPAGE), "p0");
}

TEST(SVGRefIDManager, NewManagerStartsAtZeroAgain) {
    Manager first;
    first.createReferenceID(Manager::REFGRADIENT);
    Manager second;
    EXPECT_EQ(create(second, Manager::REFGRADIENT), "g0");
    EXPECT_EQ(create(first, Manager::REFGRADIENT), "g1");
}

TEST(SVGRefIDManager, SixKindsAreNumberedFromTheStart) {
    const Manager manager;
    EXPECT_EQ(manager.nextNumbers.size(), 6U);
    for (const auto& [type, next] : manager.nextNumbers) {
        EXPECT_EQ(next, 0) << type;
    }
}

TEST(SVGRefIDManager, UnlistedKindIsNumberedAllTheSame) {
    Manager manager;
    EXPECT_EQ(create(manager, unlisted[0]), "xxx0");
    EXPECT_EQ(create(manager, unlisted[0]), "xxx1");
}

TEST(SVGRefIDManager, NumberIsReadBehindThePrefix) {
    EXPECT_EQ(number(Manager::REFPAGE, u"p12"), 12);
    EXPECT_EQ(number(Manager::REFGRADIENT, u"g0"), 0);
    EXPECT_EQ(number(unlisted[0], u"xxx7"), 7);
}

TEST(SVGRefIDManager, PrefixCountsByItsLengthAlone) {
    EXPECT_EQ(number(Manager::REFPAGE, u"q12"), 12);
    EXPECT_EQ(number(Manager::REFPAGE, u"123"), 23);
}

TEST(SVGRefIDManager, IdWithoutANumberReadsAsZero) {
    EXPECT_EQ(number(Manager::REFPAGE, u""), 0);
    EXPECT_EQ(number(Manager::REFPAGE, u"p"), 0);
    EXPECT_EQ(number(unlisted[0], u"x"), 0);
    EXPECT_EQ(number(Manager::REFPAGE, u"page"), 0);
}
