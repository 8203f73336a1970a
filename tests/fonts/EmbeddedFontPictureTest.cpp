// What viewers draw of embedded fonts, against the glyphs as cairo draws them.
#include "tests/fonts/EmbeddedFont.h"
#include "tests/support/Command.h"
#include "tests/support/SvgPage.h"
#include "tests/support/TempDir.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <map>
#include <memory>

#include <cairo-ft.h>

namespace DrawmereTest {
namespace {

constexpr int side = 400; // of a picture, which shows a page of 100 points

// Glyphs of the font of Latin letters, and where they end in font units.
constexpr std::uint16_t glyphF = 192;
constexpr std::uint16_t glyphI = 199;
constexpr std::uint16_t glyphFi = 301;
constexpr float unitsPerEm = 900;
constexpr float advanceF = 199;

/// Which pixels of a picture are dark.
using Ink = std::vector<bool>;

struct PlacedGlyph {
    std::uint16_t id;
    float x;
    float y;
};

struct CairoDeleter {
    void operator()(cairo_surface_t* surface) const { cairo_surface_destroy(surface); }

    void operator()(cairo_t* context) const { cairo_destroy(context); }

    void operator()(cairo_font_face_t* face) const { cairo_font_face_destroy(face); }
};

template <typename T> using CairoPtr = std::unique_ptr<T, CairoDeleter>;

Ink readInk(cairo_surface_t* surface) {
    constexpr unsigned char half = 128;
    cairo_surface_flush(surface);
    const int stride = cairo_image_surface_get_stride(surface);
    const unsigned char* bytes = cairo_image_surface_get_data(surface);
    const int height = std::min(side, cairo_image_surface_get_height(surface));
    const int width = std::min(side, cairo_image_surface_get_width(surface));
    Ink ink(static_cast<std::size_t>(side) * side);
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            ink[static_cast<std::size_t>(y) * side + x] = bytes[y * stride + 4 * x + 1] < half;
        }
    }
    return ink;
}

Ink readPicture(const std::string& path) {
    const CairoPtr<cairo_surface_t> surface(cairo_image_surface_create_from_png(path.c_str()));
    if (cairo_surface_status(surface.get()) != CAIRO_STATUS_SUCCESS) {
        ADD_FAILURE() << "no picture was made";
        return Ink(static_cast<std::size_t>(side) * side);
    }
    return readInk(surface.get());
}

/// Draws a document with Batik, which knows fonts of SVG 1.1.
Ink drawByBatik(const std::string& document) {
    const TempDir directory;
    directory.write("page.svg", document);
    const std::string edge = std::to_string(side);
    const CommandResult result =
        runCommand({"rasterizer", "-m", "image/png", "-bg", "255.255.255.255", "-w", edge, "-h",
                    edge, "-d", directory.path("page.png"), directory.path("page.svg")});
    EXPECT_EQ(result.status, 0) << result.output;
    return readPicture(directory.path("page.png"));
}

/// The font files, open until the process ends: cairo knows them by their addresses and keeps what
/// it has read of them.
class FontFiles {
public:
    FontFiles() { FT_Init_FreeType(&library); }

    FontFiles(const FontFiles&) = delete;
    FontFiles& operator=(const FontFiles&) = delete;

    ~FontFiles() { FT_Done_FreeType(library); }

    FT_Face open(const std::string& file) {
        FT_Face& face = faces[file];
        if (!face) {
            const std::string path = TEST_SOURCE_DIR "/data/fonts/" + file;
            EXPECT_EQ(FT_New_Face(library, path.c_str(), 0, &face), 0) << path;
        }
        return face;
    }

private:
    FT_Library library = nullptr;
    std::map<std::string, FT_Face> faces;
};

/// Draws glyphs of a font file in black.
Ink drawByCairo(const std::string& file, float size, const std::vector<PlacedGlyph>& glyphs) {
    static FontFiles files;
    constexpr double scale = side / 100.0;
    const CairoPtr<cairo_surface_t> surface(
        cairo_image_surface_create(CAIRO_FORMAT_RGB24, side, side));
    const CairoPtr<cairo_t> context(cairo_create(surface.get()));
    const CairoPtr<cairo_font_face_t> face(
        cairo_ft_font_face_create_for_ft_face(files.open(file), FT_LOAD_NO_HINTING));
    cairo_set_source_rgb(context.get(), 1, 1, 1);
    cairo_paint(context.get());
    cairo_set_source_rgb(context.get(), 0, 0, 0);
    cairo_scale(context.get(), scale, scale);
    cairo_set_font_face(context.get(), face.get());
    cairo_set_font_size(context.get(), static_cast<double>(size));
    for (const PlacedGlyph& glyph : glyphs) {
        const cairo_glyph_t placed = {glyph.id, static_cast<double>(glyph.x),
                                      static_cast<double>(glyph.y)};
        cairo_glyph_path(context.get(), &placed, 1);
        cairo_fill(context.get());
    }
    return readInk(surface.get());
}

/// Returns: success when the dark pixels are the same but for some at the edges.
testing::AssertionResult looksLike(const Ink& found, const Ink& expected) {
    constexpr std::ptrdiff_t edgeShare = 20;
    const std::ptrdiff_t dark = std::count(expected.begin(), expected.end(), true);
    std::ptrdiff_t odd = 0;
    for (std::size_t i = 0; i < expected.size(); ++i) {
        odd += found[i] != expected[i] ? 1 : 0;
    }
    if (dark > 0 && odd * edgeShare <= dark) {
        return testing::AssertionSuccess();
    }
    return testing::AssertionFailure() << odd << " pixels differ, of " << dark << " dark ones";
}

/// A page with a font of 40 points.
struct FontPage : SvgPage {
    static constexpr float size = 40;

    FontPage(const char16_t* name, bool byGlyphs, FSTYLE style = FSTYLE_NORMAL) {
        SVGFont font = makeFont(name, byGlyphs, FONTWEIGHT_NORMAL, style);
        font.fontSize = pt(size);
        drawmere.setFont(&font, &testFonts());
        drawmere.setFillColor(MoxCommonNS::MoxColor(0, 0, 0));
    }

    void draw(const UnicodeString& run, float x, float y, std::vector<TLGlyphEntry> entries = {},
              bool wholeRun = false) {
        TLStringWithGlyphInfo glyphs(std::move(entries));
        drawmere.drawText(run, pt(x), pt(y), PAINTMODE_FILL, &glyphs, wholeRun,
                          /*leftToRight=*/true);
    }
};

TEST(EmbeddedFontPicture, ATextIsDrawnWithTheOutlinesOfItsCharacters) {
    FontPage page(latinFace, /*byGlyphs=*/false);
    page.draw(u"fi", 10, 60);
    const float step = FontPage::size * advanceF / unitsPerEm;
    EXPECT_TRUE(looksLike(drawByBatik(page.document()),
                          drawByCairo("le-murmure.otf", FontPage::size,
                                      {{glyphF, 10, 60}, {glyphI, 10 + step, 60}})));
}

TEST(EmbeddedFontPicture, ALigatureIsDrawnForItsLettersAndNotWhereTheyAreDrawnApart) {
    FontPage page(latinFace, /*byGlyphs=*/true);
    page.draw(u"fi", 10, 40, {{2, glyphFi}});
    page.draw(u"f", 10, 90, {{1, glyphF}});
    page.draw(u"i", 50, 90, {{1, glyphI}});
    EXPECT_TRUE(looksLike(drawByBatik(page.document()),
                          drawByCairo("le-murmure.otf", FontPage::size,
                                      {{glyphFi, 10, 40}, {glyphF, 10, 90}, {glyphI, 50, 90}})));
}

TEST(EmbeddedFontPicture, AWholeRunIsDrawnWithItsGlyphsSideBySide) {
    FontPage page(latinFace, /*byGlyphs=*/true);
    page.draw(u"word", 10, 60, {{4, glyphF}, {0, glyphF}, {0, glyphI}}, /*wholeRun=*/true);
    const float step = FontPage::size * advanceF / unitsPerEm;
    EXPECT_TRUE(looksLike(
        drawByBatik(page.document()),
        drawByCairo("le-murmure.otf", FontPage::size,
                    {{glyphF, 10, 60}, {glyphF, 10 + step, 60}, {glyphI, 10 + 2 * step, 60}})));
}

TEST(EmbeddedFontPicture, QuadraticOutlinesAreThoseOfTheFont) {
    constexpr std::uint16_t parenthesis = 20;
    // The face calls itself slanted; upright text would not be drawn with it.
    FontPage page(arabicFace, /*byGlyphs=*/true, FSTYLE_ITALIC);
    page.draw(u"x", 40, 60, {{1, parenthesis}});
    EXPECT_TRUE(
        looksLike(drawByBatik(page.document()),
                  drawByCairo("SimpArabicTest.ttf", FontPage::size, {{parenthesis, 40, 60}})));
}

TEST(EmbeddedFontPicture, WebKitDrawsTheOutlinesToo) {
    const TempDir directory;
    FontPage page(latinFace, /*byGlyphs=*/true);
    page.draw(u"fi", 10, 60, {{2, glyphFi}});
    std::string document = page.document();
    // It shows a point as four thirds of a pixel, whatever is asked for.
    const auto replace = [&document](const std::string& from, const std::string& to) {
        document.replace(document.find(from), from.size(), to);
    };
    replace("width=\"100pt\"", "width=\"400\"");
    replace("height=\"100pt\"", "height=\"400\"");
    directory.write("page.svg", document);
    const CommandResult result =
        runCommand({"wkhtmltoimage", "--quiet", "--width", "400", "--height", "400", "--format",
                    "png", directory.path("page.svg"), directory.path("page.png")});
    EXPECT_EQ(result.status, 0) << result.output;
    EXPECT_TRUE(looksLike(readPicture(directory.path("page.png")),
                          drawByCairo("le-murmure.otf", FontPage::size, {{glyphFi, 10, 60}})));
}

} // namespace
} // namespace DrawmereTest
