#include "path/SVGDrawElement.h"

#include "tests/path/Segments.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <limits>
#include <string>

#include <malloc.h> // malloc_usable_size is no part of standard C++

namespace DrawmereNS {
namespace {

using DrawmereTest::utf8;
using Point = MoxPointT<MoxLength>;

constexpr float largest = std::numeric_limits<float>::max();
constexpr float infinite = std::numeric_limits<float>::infinity();
constexpr float undefined = std::numeric_limits<float>::quiet_NaN();

/// What lies this far from zero, and no farther, is zero.
constexpr float limit = MoxLength(0.001F, MoxCommonNS::MOXUNIT_MM).getRawValue();

std::string textOf(SVGDrawElement& segment) {
    const char* text = segment.toString();
    return text ? text : "(null)";
}

std::string lengthText(float length) {
    char buffer[64];
    SVGDrawElement::makeLengthToStringValue(pt(length), buffer, sizeof buffer);
    return buffer;
}

std::string relativeLine(float x, float y) {
    const MoxPtr<SVGDrawElement> line = lineTo(x, y);
    line->makeRelative(Point());
    return textOf(*line);
}

std::size_t sizeOnHeap(const SVGDrawElement& segment) {
    constexpr std::size_t allocatorHeader = 8;
    return malloc_usable_size(const_cast<SVGDrawElement*>(&segment)) + allocatorHeader;
}

TEST(SVGDrawElement, TheNumbersOfCommandsAreOddForAbsoluteOnes) {
    for (int name = -3; name <= 13; ++name) {
        const MoxPtr<SVGDrawElement> segment = closeSubpath();
        segment->setDrawName(static_cast<DrawmereDrawElementEnum>(name));
        const bool expected = name == 1 || name == 3 || name == 5 || name == 7 || name == 9;
        EXPECT_EQ(segment->isAbsolute(), expected) << name;
    }
}

TEST(SVGDrawElement, ReleasesItselfWithTheLastReference) {
    struct Watched : SVGDrawElementClose {
        explicit Watched(bool& flag) : gone(flag) {}

        ~Watched() override { gone = true; }

        bool& gone;
    };

    bool gone = false;
    MoxPtr<SVGDrawElement> segment(new Watched(gone));
    EXPECT_EQ(segment->getReferenceCount(), 1);
    segment->toString();
    segment = nullptr;
    EXPECT_TRUE(gone);
}

TEST(SVGDrawElement, AbsoluteTextsHaveACommaInAPairAndABlankBetweenPairs) {
    EXPECT_EQ(textOf(*moveTo(10, 20)), "M10,20");
    EXPECT_EQ(textOf(*lineTo(-1.5F, -0.25F)), "L-1.5,-.25");
    EXPECT_EQ(textOf(*closeSubpath()), "Z");
    EXPECT_EQ(textOf(*cubicTo(at(1, 2), at(-3, 4), at(5, -6))), "C1,2 -3,4 5,-6");
    EXPECT_EQ(textOf(*quadraticTo(at(1, 2), at(-3, -4))), "Q1,2 -3,-4");
}

TEST(SVGDrawElement, AnAbsoluteLineIsNeverShortened) {
    EXPECT_EQ(textOf(*lineTo(0, 5)), "L0,5");
    EXPECT_EQ(textOf(*lineTo(5, 0)), "L5,0");
    EXPECT_EQ(textOf(*lineTo(0, 0)), "L0,0");
}

TEST(SVGDrawElement, ARelativeLineAlongAnAxisIsShortened) {
    EXPECT_EQ(relativeLine(0, 5), "v5");
    EXPECT_EQ(relativeLine(5, 0), "h5");
    EXPECT_EQ(relativeLine(0, 0), "v0");
    EXPECT_EQ(relativeLine(1, 2), "l1,2");
    EXPECT_EQ(relativeLine(0, -5), "v-5");
    EXPECT_EQ(relativeLine(-5, 0), "h-5");
}

TEST(SVGDrawElement, ALineIsAlongAnAxisUpToAThousandthOfAMillimetre) {
    const float longer = std::nextafter(limit, 1.0F);
    EXPECT_EQ(relativeLine(limit, 5), "v5");
    EXPECT_EQ(relativeLine(-limit, 5), "v5");
    EXPECT_EQ(relativeLine(5, limit), "h5");
    EXPECT_EQ(relativeLine(5, -limit), "h5");
    EXPECT_EQ(relativeLine(longer, 5), "l.003,5");
    EXPECT_EQ(relativeLine(5, -longer), "l5,-.003");
    EXPECT_EQ(relativeLine(limit, limit), "v0");
}

TEST(SVGDrawElement, ALineWithAnyOtherNameIsWrittenAsARelativeOne) {
    for (const int name : {0, 1, 2, 4, 5, 9, 11, -1, 99}) {
        SVGDrawElementLineTo line(at(0, 5));
        line.setDrawName(static_cast<DrawmereDrawElementEnum>(name));
        EXPECT_STREQ(line.toString(), "v5") << name;
    }
}

TEST(SVGDrawElement, RelativeCurvesAndMovesAreNeverShortened) {
    const MoxPtr<SVGDrawElement> move = moveTo(0, 5);
    move->makeRelative(Point());
    EXPECT_EQ(textOf(*move), "m0,5");
    const MoxPtr<SVGDrawElement> cubic = cubicTo(at(1, 1), at(1, 1), at(1, 1));
    cubic->makeRelative(at(1, 1));
    EXPECT_EQ(textOf(*cubic), "c0,0 0,0 0,0");
}

// On purpose: a quadratic curve keeps its name when it becomes relative. Taking the even number
// would make the manager skip it.
TEST(SVGDrawElement, AQuadraticCurveSaysThatItIsAbsoluteEvenWhenItIsRelative) {
    const MoxPtr<SVGDrawElement> curve = quadraticTo(at(3, 4), at(5, 6));
    curve->makeRelative(at(1, 1));
    EXPECT_TRUE(curve->isAbsolute());
    EXPECT_EQ(curve->drawName, DRAWELEMENT_QUADRATIC);
    EXPECT_EQ(textOf(*curve), "q2,3 4,5");
}

bool staysAbsolute(const MoxPtr<SVGDrawElement>& segment) {
    EXPECT_TRUE(segment->isAbsolute());
    segment->makeRelative(Point());
    return segment->isAbsolute();
}

TEST(SVGDrawElement, OtherSegmentsSayThatTheyAreRelative) {
    EXPECT_FALSE(staysAbsolute(moveTo(1, 2)));
    EXPECT_FALSE(staysAbsolute(lineTo(1, 2)));
    EXPECT_FALSE(staysAbsolute(closeSubpath()));
    EXPECT_FALSE(staysAbsolute(cubicTo(at(1, 2), at(3, 4), at(5, 6))));
}

TEST(SVGDrawElement, ACoordinateThatIsNoNumberStaysWhatItIs) {
    const MoxPtr<SVGDrawElement> line = lineTo(undefined, 7);
    line->makeRelative(at(1, 2));
    EXPECT_TRUE(std::isnan(line->getPoint().x.getRawValue()));
    EXPECT_EQ(line->getPoint().y, pt(5));
    EXPECT_EQ(textOf(*line), "l0,5");
}

TEST(SVGDrawElement, CoordinatesWithoutAFiniteNumberAreZero) {
    EXPECT_EQ(textOf(*moveTo(infinite, -infinite)), "M0,0");
    EXPECT_EQ(textOf(*cubicTo(at(undefined, 1), at(2, infinite), at(-infinite, 3))),
              "C0,1 2,0 0,3");
    const MoxPtr<SVGDrawElement> line = lineTo(largest, 1);
    line->makeRelative(at(-largest, undefined));
    EXPECT_EQ(textOf(*line), "l0,0");
}

TEST(SVGDrawElement, TheLargestCoordinatesKeepAllTheirDigits) {
    const std::string number = lengthText(-largest);
    const std::string pair = number + "," + number;
    const Point corner = at(-largest, -largest);
    EXPECT_EQ(number, "-340282346638528859811704183484516925440");
    EXPECT_EQ(textOf(*moveTo(-largest, -largest)), "M" + pair);
    EXPECT_EQ(textOf(*lineTo(-largest, -largest)), "L" + pair);
    EXPECT_EQ(relativeLine(0, -largest), "v" + number);
    EXPECT_EQ(textOf(*quadraticTo(corner, corner)), "Q" + pair + " " + pair);
    const std::string cubic = textOf(*cubicTo(corner, corner, corner));
    EXPECT_EQ(cubic, "C" + pair + " " + pair + " " + pair);
    EXPECT_LE(cubic.size(), SVGDrawElement::maxText);
}

TEST(SVGDrawElement, TheTextFollowsTheSegmentAndStaysInItsPlace) {
    const MoxPtr<SVGDrawElement> line = lineTo(3, 4);
    const char* text = line->toString();
    EXPECT_STREQ(text, "L3,4");
    line->makeRelative(at(1, 1));
    EXPECT_EQ(line->toString(), text);
    EXPECT_STREQ(text, "l2,3");
}

TEST(SVGDrawElement, ALineTakesSixtyFourBytesWithItsEntryInAVectorThatHasJustGrown) {
    constexpr std::size_t entry = 2 * sizeof(MoxPtr<SVGDrawElement>);
    EXPECT_LE(sizeOnHeap(*lineTo(1, 2)) + entry, 64U);
    EXPECT_LE(sizeof(SVGDrawElementLineTo), 40U);
    EXPECT_LE(sizeof(SVGDrawElementMoveTo), 40U);
    EXPECT_LE(sizeof(SVGDrawElementClose), 40U);
}

TEST(SVGDrawElement, TheRuleWritesIntoABufferWithATerminator) {
    char buffer[16];
    std::fill(std::begin(buffer), std::end(buffer), '#');
    SVGDrawElement::makeLengthToStringValue(pt(-0.25F), buffer, sizeof buffer);
    EXPECT_STREQ(buffer, "-.25");
    EXPECT_EQ(buffer[5], '#');
    SVGDrawElement::makePointToStringValue(at(12.5F, -1), buffer, sizeof buffer);
    EXPECT_STREQ(buffer, "12.5,-1");
    EXPECT_EQ(buffer[8], '#');
}

TEST(SVGDrawElement, ATextThatDoesNotFitIsCut) {
    char buffer[] = "########";
    SVGDrawElement::makeLengthToStringValue(pt(largest), buffer, 6);
    EXPECT_STREQ(buffer, "34028");
    EXPECT_EQ(buffer[6], '#');
    SVGDrawElement::makePointToStringValue(at(12, 34), buffer, 5);
    EXPECT_STREQ(buffer, "12,3");
    SVGDrawElement::makePointToStringValue(at(12, 34), buffer, 6);
    EXPECT_STREQ(buffer, "12,34");
    SVGDrawElement::makeLengthToStringValue(pt(7), buffer, 1);
    EXPECT_STREQ(buffer, "");
}

TEST(SVGDrawElement, NothingIsWrittenWithoutABuffer) {
    char buffer[] = "##";
    SVGDrawElement::makeLengthToStringValue(pt(7), buffer, 0);
    SVGDrawElement::makePointToStringValue(at(7, 8), nullptr, 16);
    EXPECT_STREQ(buffer, "##");
}

TEST(SVGDrawElement, TheRuleGivesStringsOfAnyLength) {
    EXPECT_EQ(utf8(SVGDrawElement::makeLengthToStringValue(pt(12.5F))), "12.5");
    EXPECT_EQ(utf8(SVGDrawElement::makeLengthToStringValue(pt(0))), "0");
    EXPECT_EQ(utf8(SVGDrawElement::makeLengthToStringValue(pt(undefined))), "0");
    EXPECT_EQ(utf8(SVGDrawElement::makeLengthToStringValue(pt(limit))), "0");
    EXPECT_EQ(utf8(SVGDrawElement::makeLengthToStringValue(pt(largest))), lengthText(largest));
    EXPECT_EQ(utf8(SVGDrawElement::makePointToStringValue(at(-0.5F, 1000000))), "-.5,1000000");
    EXPECT_EQ(utf8(SVGDrawElement::makePointToStringValue(at(-largest, -largest))),
              lengthText(-largest) + "," + lengthText(-largest));
}

} // namespace
} // namespace DrawmereNS
