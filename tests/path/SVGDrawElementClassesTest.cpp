// What the classes of segments have in common, and what each of them does.
#include "tests/path/Segments.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <iterator>
#include <string>
#include <vector>

namespace DrawmereNS {
namespace {

using Point = MoxPointT<MoxLength>;

constexpr std::uint32_t objectBaseId = 0xDF537371;
constexpr std::uint32_t countedId = 0xD18D040A;
constexpr std::uint32_t elementId = 0x28116EDF;
constexpr std::uint32_t closeId = 0xA9477E24;
constexpr std::uint32_t pointToId = 0xE2EDBCC5;
constexpr std::uint32_t moveToId = 0x0136266E;
constexpr std::uint32_t lineToId = 0xFC9F018C;
constexpr std::uint32_t cubicId = 0xCE93740D;
constexpr std::uint32_t quadraticId = 0xAD56D32A;

constexpr std::uint32_t segmentIds[] = {elementId, closeId, pointToId,  moveToId,
                                        lineToId,  cubicId, quadraticId};

struct BareElement : SVGDrawElement {
    BareElement() : SVGDrawElement('X') {}
};

struct BarePoint : SVGDrawElementPointTo {
    BarePoint() : SVGDrawElementPointTo('X', at(1, 2)) {}
};

struct ClassRow {
    std::function<SVGDrawElement*()> make;
    const char* name;
    std::uint32_t id;
    std::vector<std::uint32_t> classes; ///< its own and its bases
    std::vector<Point> points;          ///< what the three getters give
    std::vector<Point> kept;            ///< the same after (11, 12), (13, 14), (15, 16) were set
    const char* relative;               ///< the text after (1, 1) became the origin
    int relativeName;                   ///< the name after that
};

SVGDrawElement* makeCubic() {
    return new SVGDrawElementCubicBezierCurveTo(at(1, 2), at(3, 4), at(5, 6));
}

SVGDrawElement* makeQuadratic() {
    return new SVGDrawElementQuadraticBezierCurveTo(at(1, 2), at(3, 4));
}

const std::vector<Point> noPoints(3);

const ClassRow classRows[] = {
    {[] { return new BareElement; },
     "SVGDrawElement",
     elementId,
     {elementId},
     noPoints,
     noPoints,
     nullptr,
     DRAWELEMENT_UNSET},
    {[] { return new SVGDrawElementClose; },
     "SVGDrawElementClose",
     closeId,
     {elementId, closeId},
     noPoints,
     noPoints,
     "z",
     DRAWELEMENT_CLOSE_RELATIVE},
    {[] { return new BarePoint; },
     "SVGDrawElementPointTo",
     pointToId,
     {elementId, pointToId},
     {at(1, 2), {}, {}},
     {at(11, 12), {}, {}},
     nullptr,
     DRAWELEMENT_UNSET},
    {[] { return new SVGDrawElementMoveTo(at(1, 2)); },
     "SVGDrawElementMoveTo",
     moveToId,
     {elementId, pointToId, moveToId},
     {at(1, 2), {}, {}},
     {at(11, 12), {}, {}},
     "m10,11",
     DRAWELEMENT_MOVE_RELATIVE},
    {[] { return new SVGDrawElementLineTo(at(1, 2)); },
     "SVGDrawElementLineTo",
     lineToId,
     {elementId, pointToId, lineToId},
     {at(1, 2), {}, {}},
     {at(11, 12), {}, {}},
     "l10,11",
     DRAWELEMENT_LINE_RELATIVE},
    {makeCubic,
     "SVGDrawElementCubicBezierCurveTo",
     cubicId,
     {elementId, cubicId},
     {at(5, 6), at(1, 2), at(3, 4)},
     {at(5, 6), at(13, 14), at(15, 16)},
     "c12,13 14,15 4,5",
     DRAWELEMENT_CUBIC_RELATIVE},
    // On purpose: of a quadratic curve the second pair of accessors reaches the first point, and
    // the others reach nothing.
    {makeQuadratic,
     "SVGDrawElementQuadraticBezierCurveTo",
     quadraticId,
     {elementId, quadraticId},
     {{}, {}, at(1, 2)},
     {{}, {}, at(15, 16)},
     "q14,15 2,3",
     DRAWELEMENT_UNSET},
};

std::vector<Point> pointsOf(const SVGDrawElement& segment) {
    return {segment.getPoint(), segment.getPoint1(), segment.getPoint2()};
}

/// Returns: the numbers of the segment classes that the segment is of.
std::vector<std::uint32_t> classesOf(const SVGDrawElement& segment) {
    std::vector<std::uint32_t> ids;
    std::ranges::copy_if(segmentIds, std::back_inserter(ids),
                         [&segment](std::uint32_t id) { return segment.isA(id); });
    return ids;
}

TEST(SVGDrawElementClasses, AnswersItsClass) {
    for (const ClassRow& row : classRows) {
        const MoxPtr<SVGDrawElement> segment(row.make());
        EXPECT_EQ(segment->getTypeID(), row.id) << row.name;
        EXPECT_STREQ(segment->getTypeName(), row.name);
        EXPECT_EQ(classesOf(*segment), row.classes) << row.name;
    }
}

TEST(SVGDrawElementClasses, IsCountedInEveryClass) {
    for (const ClassRow& row : classRows) {
        const MoxPtr<SVGDrawElement> segment(row.make());
        EXPECT_TRUE(segment->isA(objectBaseId)) << row.name;
        EXPECT_TRUE(segment->isA(countedId)) << row.name;
        EXPECT_FALSE(segment->isA(0)) << row.name;
    }
}

TEST(SVGDrawElementClasses, StartsWithoutTypeAndName) {
    for (const ClassRow& row : classRows) {
        const MoxPtr<SVGDrawElement> segment(row.make());
        EXPECT_EQ(segment->drawType, 11) << row.name;
        EXPECT_EQ(segment->drawName, 11) << row.name;
        segment->setDrawType(DRAWELEMENT_NONE);
        segment->setDrawName(DRAWELEMENT_CUBIC);
        EXPECT_EQ(segment->drawType, 0) << row.name;
        EXPECT_EQ(segment->drawName, 7) << row.name;
    }
}

TEST(SVGDrawElementClasses, KeepsThePointsThatItsClassHas) {
    for (const ClassRow& row : classRows) {
        const MoxPtr<SVGDrawElement> segment(row.make());
        EXPECT_EQ(pointsOf(*segment), row.points) << row.name;
        segment->setPoint(at(11, 12));
        segment->setPoint1(at(13, 14));
        segment->setPoint2(at(15, 16));
        EXPECT_EQ(pointsOf(*segment), row.kept) << row.name;
    }
}

TEST(SVGDrawElementClasses, BecomesRelativeAsItsClassDoes) {
    for (const ClassRow& row : classRows) {
        const MoxPtr<SVGDrawElement> segment(row.make());
        segment->setPoint(at(11, 12));
        segment->setPoint1(at(13, 14));
        segment->setPoint2(at(15, 16));
        segment->makeRelative(at(1, 1));
        EXPECT_STREQ(segment->toString(), row.relative) << row.name;
        EXPECT_EQ(segment->drawName, row.relativeName) << row.name;
    }
}

TEST(SVGDrawElementClasses, TheTextIsWrittenInPlaceAsToStringGivesIt) {
    for (const ClassRow& row : classRows) {
        const MoxPtr<SVGDrawElement> segment(row.make());
        char text[SVGDrawElement::maxText];
        const char* end = segment->writeText(text);
        const std::string written(static_cast<const char*>(text), end);
        EXPECT_EQ(written, segment->toString() ? segment->toString() : "") << row.name;
    }
}

} // namespace
} // namespace DrawmereNS
