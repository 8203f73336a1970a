// Paths of many segments.
#include "path/SVGPathManager.h"

#include "tests/path/OpenPath.h"
#include "tests/path/PathReader.h"
#include "tests/path/Segments.h"

#include <gtest/gtest.h>

#include <limits>
#include <random>

namespace DrawmereNS {
namespace {

using DrawmereTest::PathReader;

constexpr float largest = std::numeric_limits<float>::max();
constexpr int manySegments = 1'000'000;

TEST(SVGPathManagerLong, APathLongerThanTheFirstRoomIsWhole) {
    OpenPath path;
    std::string expected = "M0,0";
    path.move(0, 0);
    for (int i = 1; i <= 20'000; ++i) {
        path.line(static_cast<float>(i % 2), static_cast<float>(i));
        expected += i % 2 == 1 ? "l1,1" : "l-1,1";
    }
    EXPECT_EQ(path.manager.takePathData().getAsciiText(), expected);
}

TEST(SVGPathManagerLong, BytesOfOtherSegmentsAreCharactersInALongPathToo) {
    struct Foreign : SVGDrawElement {
        Foreign() : SVGDrawElement('X') {}

        char* writeText(char* out) const override {
            *out = '\xE4';
            return out + 1;
        }
    };

    OpenPath path;
    path.move(0, 0);
    for (int i = 1; i <= 20'000; ++i) {
        path.line(1, static_cast<float>(i));
    }
    path.add(MoxPtr<SVGDrawElement>(new Foreign));
    const UnicodeString text = path.manager.takePathData().toString();
    EXPECT_EQ(text.charAt(text.length() - 1), u'\u00E4');
    EXPECT_EQ(text.charAt(0), u'M');
}

TEST(SVGPathManagerLong, AMillionSegmentsAreWrittenWhole) {
    OpenPath path;
    path.move(0, 0);
    for (int i = 1; i <= manySegments; ++i) {
        path.line(static_cast<float>(i), static_cast<float>(2 * i));
    }
    const UnicodeString& data = path.manager.getPathSeg();
    ASSERT_EQ(data.length(), 4 + 4 * manySegments);
    UnicodeString expected(u"M0,0");
    for (int i = 0; i < manySegments; ++i) {
        expected.append(u"l1,2", 4);
    }
    EXPECT_TRUE(data == expected);
}

TEST(SVGPathManagerLong, TheLongestTextsAreWrittenWholeAcrossEveryGrowth) {
    const MoxPointT<MoxLength> corner = at(-largest, -largest);
    OpenPath path;
    std::string expected;
    for (int i = 0; i < 2000; ++i) {
        const MoxPtr<SVGDrawElement> segment =
            i % 7 == 3 ? closeSubpath() : cubicTo(corner, corner, corner);
        expected += segment->toString();
        path.add(segment);
    }
    EXPECT_EQ(path.data(), expected);
}

/// Segments at whole coordinates, where relative numbers are exact, and where each of them ends.
struct RandomPath {
    explicit RandomPath(unsigned int seed) : random(seed) {
        addPoint(moveTo(0, 0), at(0, 0));
        for (int i = 0; i < 60; ++i) {
            addSegment();
        }
    }

    void addSegment() {
        const MoxPointT<MoxLength> target = at(number(), number());
        const float x = target.x.getRawValue();
        const float y = target.y.getRawValue();
        switch (random() % 4) {
        case 0:
            start = target;
            return addPoint(moveTo(x, y), target);
        case 1:
            return addPoint(lineTo(x, y), target);
        case 2:
            return addPoint(cubicTo(at(number(), y), at(x, number()), target), target);
        default:
            return addPoint(closeSubpath(), start);
        }
    }

    void addPoint(const MoxPtr<SVGDrawElement>& segment, MoxPointT<MoxLength> target) {
        segments.push_back(segment);
        ends.push_back(target);
    }

    float number() { return static_cast<float>(random() % 9) - 4.0F; }

    std::mt19937 random;
    MoxPointT<MoxLength> start;
    std::vector<MoxPtr<SVGDrawElement>> segments;
    std::vector<MoxPointT<MoxLength>> ends;
};

std::string writeData(const RandomPath& drawn) {
    OpenPath path;
    for (const MoxPtr<SVGDrawElement>& segment : drawn.segments) {
        path.add(segment);
    }
    return path.data();
}

TEST(SVGPathManagerLong, AReaderOfTheDataArrivesWhereTheSegmentsEnd) {
    for (unsigned int seed = 1; seed <= 200; ++seed) {
        const RandomPath drawn(seed);
        const std::string data = writeData(drawn);
        const PathReader reader(data);
        EXPECT_EQ(reader.error, "") << data;
        EXPECT_EQ(reader.ends, drawn.ends) << data;
    }
}

} // namespace
} // namespace DrawmereNS
