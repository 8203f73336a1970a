#include "fonts/SVGGlyphVector.h"

#include <gtest/gtest.h>
#include <string_view>
#include <type_traits>

namespace DrawmereTest {
namespace {

using DrawmereNS::SVGGlyphVector;

TEST(SVGGlyphVector, KeepsACopyOfTheText) {
    char16_t text[] = u"ffi";
    const SVGGlyphVector glyph(7, text, 3);
    text[0] = u'x';
    EXPECT_EQ(glyph.getGlyIndex(), 7);
    EXPECT_EQ(glyph.getUniCount(0), 3);
    EXPECT_EQ(std::u16string_view(glyph.getUnicode(0), 3), u"ffi");
}

TEST(SVGGlyphVector, TheIndexOfAReadingPlaysNoPart) {
    const SVGGlyphVector glyph(7, u"fi", 2);
    EXPECT_EQ(glyph.getUnicode(65535), glyph.getUnicode(0));
    EXPECT_EQ(glyph.getUniCount(65535), 2);
}

TEST(SVGGlyphVector, CopiesNoMoreUnitsThanAreAskedFor) {
    const SVGGlyphVector glyph(65535, u"fix", 1);
    EXPECT_EQ(glyph.getGlyIndex(), 65535);
    EXPECT_EQ(std::u16string_view(glyph.getUnicode(0), glyph.getUniCount(0)), u"f");
}

TEST(SVGGlyphVector, ACountBelowOneCopiesNothing) {
    EXPECT_EQ(SVGGlyphVector(1, u"x", 0).getUnicode(0), nullptr);
    EXPECT_EQ(SVGGlyphVector(1, u"x", 0).getUniCount(0), 0);
    EXPECT_EQ(SVGGlyphVector(1, u"x", -3).getUnicode(0), nullptr);
    EXPECT_EQ(SVGGlyphVector(1, u"x", -3).getUniCount(0), -3);
}

TEST(SVGGlyphVector, ANullTextHasNoUnits) {
    const SVGGlyphVector glyph(1, nullptr, 5);
    EXPECT_EQ(glyph.getUnicode(0), nullptr);
    EXPECT_EQ(glyph.getUniCount(0), 0);
}

TEST(SVGGlyphVector, HasAVirtualDestructorAndNoCopies) {
    EXPECT_TRUE(std::has_virtual_destructor_v<SVGGlyphVector>);
    EXPECT_FALSE(std::is_copy_constructible_v<SVGGlyphVector>); // two would free one text
}

} // namespace
} // namespace DrawmereTest
