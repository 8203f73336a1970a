#include "tests/foundation/TestFonts.h"

#include "tests/support/TempDir.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <sstream>
#include <utility>

namespace DrawmereTest {

using namespace MoxFontService_NS;

namespace {

// All tests of this program see the fonts of the tests alone.
class OwnFonts : public testing::Environment {
public:
    void SetUp() override {
        const std::string folder = std::string(TEST_SOURCE_DIR) + "/data/fonts";
        place.write("fonts.conf",
                    fontConfiguration(folder, place.path("cache"),
                                      "<alias><family>Slab Sign</family>"
                                      "<prefer><family>Lobster</family></prefer></alias>"));
        setenv("FONTCONFIG_FILE", place.path("fonts.conf").c_str(), /*replace=*/1);
    }

private:
    TempDir place;
};

const testing::Environment* const ownFonts = testing::AddGlobalTestEnvironment(new OwnFonts);

} // namespace

std::string fontFile(const std::string& name) {
    return std::string(TEST_SOURCE_DIR) + "/data/fonts/" + name;
}

std::string fontBytes(const std::string& name) {
    std::ifstream file(fontFile(name), std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

std::string fontConfiguration(const std::string& folder, const std::string& cacheFolder,
                              const std::string& rules) {
    return "<?xml version=\"1.0\"?><!DOCTYPE fontconfig SYSTEM \"urn:fontconfig:fonts.dtd\">"
           "<fontconfig><dir>" +
           folder + "</dir><cachedir>" + cacheFolder + "</cachedir>" + rules + "</fontconfig>";
}

SetVariable::SetVariable(std::string name, const std::string& value) : variable(std::move(name)) {
    const char* old = std::getenv(variable.c_str());
    wasSet = old != nullptr;
    before = wasSet ? old : "";
    setenv(variable.c_str(), value.c_str(), /*replace=*/1);
}

SetVariable::~SetVariable() {
    if (wasSet) {
        setenv(variable.c_str(), before.c_str(), /*replace=*/1);
    } else {
        unsetenv(variable.c_str());
    }
}

std::string outlineOf(const FS_FontInfo& font, unsigned short glyphId) {
    FS_GlyphDrawInfo info;
    if (!font.getGlyphDrawInfo(glyphId, info, /*reserved=*/false)) {
        return "unreadable";
    }
    std::ostringstream text;
    for (const FS_GlyphPolygon& polygon : info.polygons) {
        auto point = polygon.points.begin();
        text << 'M' << point->x << ',' << point->y << ' ';
        ++point;
        for (const int type : polygon.segmentTypes) {
            text << "LQC"[type];
            for (int i = 0; i <= type; ++i, ++point) {
                text << point->x << ',' << point->y << ' ';
            }
        }
        EXPECT_EQ(point, polygon.points.end());
        text << 'Z';
    }
    return text.str();
}

} // namespace DrawmereTest
