/// Font files made in memory, of outlines that a test spells out.
#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <string>
#include <vector>

namespace DrawmereTest {

/// A point of a TrueType outline.
struct TinyPoint {
    int x = 0;
    int y = 0;
    bool onCurve = true;
};

using TinyContour = std::vector<TinyPoint>;

/// One axis of a variable font. Setting it from its default, which is its least value, to its most
/// shifts each outline to the right, by 100 for the first axis, 200 for the second and so on.
struct TinyAxis {
    std::array<char, 4> tag;
    int least = 0;
    int most = 0;
    bool fromMost = false; ///< the default is the most instead, and the shift that to the least
};

/// A font with TrueType outlines. Glyph 0 is there from the beginning, empty.
class TinyFont {
public:
    explicit TinyFont(std::string familyName);

    /// Adds a glyph. Returns: its number.
    int addGlyph(const std::vector<TinyContour>& contours, int advance = 500);

    /// Adds a glyph that consists of others. Returns: its number.
    int addComposite(const std::vector<int>& parts, int advance = 500);

    /// Returns: the font file.
    std::string build() const;

    /// Returns: a collection of fonts.
    static std::string buildCollection(const std::vector<TinyFont>& fonts);

    std::string family;
    std::string style = "Regular";
    std::string postScriptName;
    std::string typographicFamily; ///< of which the family is one width or weight
    std::string foreignFamily;     ///< the family in German, stored before the English one
    int weight = 400;
    int widthClass = 5;
    bool italic = false;
    int unitsPerEm = 1000;
    std::map<int, int> characters; ///< glyphs by character
    bool symbolic = false;         ///< the characters are encoded as symbols
    std::vector<int> heights;      ///< vertical advances; empty for a font without
    std::vector<TinyAxis> axes;

private:
    struct Glyph {
        std::string bytes;
        int pointCount;
        int advance;
    };

    using Tables = std::map<std::string, std::string>;

    Tables buildTables() const;
    std::string buildHead() const;
    std::string buildLineHeader(int metricCount) const;
    std::string buildOutlineLimits() const;
    std::string buildCharMap() const;
    std::string buildLongCharMap() const;
    std::string buildNames() const;
    std::string buildStyle() const;
    std::string buildAxes() const;
    std::string buildVariations() const;
    void appendGlyphs(Tables& tables) const;
    static std::string assemble(const Tables& tables, std::size_t offset);

    std::vector<Glyph> glyphs;
};

/// Returns: a Type 1 font called "Tiny Type One" whose letter A is the triangle 0,0 500,0 250,700
/// with an advance of 600, and whose letter B is one cubic curve.
std::string buildTypeOne();

/// Returns: a font of bitmaps, called "Tiny Bitmap", that has the letter A.
std::string buildBitmapFont();

} // namespace DrawmereTest
