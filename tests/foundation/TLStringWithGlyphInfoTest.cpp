#include "foundation/records/TLStringWithGlyphInfo.h"

#include <gtest/gtest.h>

using namespace TalFont;

TEST(TLStringWithGlyphInfo, IsEmptyAtFirst) {
    EXPECT_TRUE(TLStringWithGlyphInfo().entries.empty());
}

TEST(TLStringWithGlyphInfo, KeepsItsEntriesInOrder) {
    const TLStringWithGlyphInfo glyphs({{2, 70}, {0, 71}, {1, 72}});
    ASSERT_EQ(glyphs.entries.size(), 3U);
    EXPECT_EQ(glyphs.entries[0].charCount, 2);
    EXPECT_EQ(glyphs.entries[0].glyphId, 70);
    EXPECT_EQ(glyphs.entries[1].charCount, 0);
    EXPECT_EQ(glyphs.entries[1].glyphId, 71);
    EXPECT_EQ(glyphs.entries[2].charCount, 1);
    EXPECT_EQ(glyphs.entries[2].glyphId, 72);
}

TEST(TLStringWithGlyphInfo, EntryStandsForNoGlyphUntilItIsSet) {
    const TLGlyphEntry entry;
    EXPECT_EQ(entry.charCount, 0);
    EXPECT_EQ(entry.glyphId, TLGlyphEntry::noGlyph);
    EXPECT_EQ(TLGlyphEntry::noGlyph, 65535);
}
