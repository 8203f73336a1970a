#include "foundation/fontservice/FS_FontConfig.h"

#include "foundation/fontservice/FS_SystemFonts.h"
#include "tests/foundation/TestFonts.h"
#include "tests/support/TempDir.h"
#include "tests/support/TinyFont.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <thread>

using namespace DrawmereTest;
using namespace MoxFontService_NS;

namespace {

// The rule by which configurations answer every name with some font.
constexpr const char* anyNameRule =
    "<match target=\"pattern\">"
    "<test qual=\"all\" name=\"family\" compare=\"not_eq\"><string>sans-serif</string></test>"
    "<test qual=\"all\" name=\"family\" compare=\"not_eq\"><string>serif</string></test>"
    "<test qual=\"all\" name=\"family\" compare=\"not_eq\"><string>monospace</string></test>"
    "<edit name=\"family\" mode=\"append_last\"><string>sans-serif</string></edit></match>";

constexpr const char* aliases =
    "<alias binding=\"same\"><family>Old Face</family>"
    "<accept><family>Not Installed</family><family>Tiny Mono</family></accept></alias>"
    "<alias><family>Lost Face</family><prefer><family>Not Installed</family></prefer></alias>"
    "<alias><family>Kind Of Sans</family><default><family>sans-serif</family></default></alias>"
    "<alias><family>Kind Of Mono</family><default><family>monospace</family></default></alias>"
    "<match target=\"pattern\"><test name=\"family\"><string>plain</string></test>"
    "<edit name=\"family\" mode=\"assign\" binding=\"same\"><string>serif</string></edit></match>";

constexpr const char* generics =
    "<alias><family>serif</family><prefer><family>Tiny Serif</family></prefer></alias>"
    "<alias><family>sans-serif</family><prefer><family>Tiny Sans</family></prefer></alias>"
    "<alias><family>monospace</family><prefer><family>Tiny Mono</family></prefer></alias>";

TinyFont makeTiny(const std::string& family, const std::string& style, int weight, bool italic,
                  int widthClass) {
    TinyFont tiny(family);
    tiny.style = style;
    tiny.weight = weight;
    tiny.italic = italic;
    tiny.widthClass = widthClass;
    tiny.addGlyph({{{0, 0}, {500, 0}, {250, 700}}});
    return tiny;
}

// A system with fonts of its own.
class FS_FontConfigTest : public testing::Test {
public:
    FS_FontConfigTest() {
        std::filesystem::create_directory(folder.path("fonts"));
        folder.write("fonts/sans.ttf", makeTiny("Tiny Sans", "Regular", 400, false, 5).build());
        folder.write("fonts/sans-b.ttf", makeTiny("Tiny Sans", "Bold", 700, false, 5).build());
        folder.write("fonts/sans-i.ttf", makeTiny("Tiny Sans", "Italic", 400, true, 5).build());
        folder.write("fonts/sans-c.ttf", makeTiny("Tiny Sans", "Condensed", 400, false, 3).build());
        TinyFont serif = makeTiny("Tiny Serif", "Regular", 400, false, 5);
        serif.postScriptName = "TinySerif-Roman";
        folder.write("fonts/serif.ttf", serif.build());
        folder.write("fonts/mono.ttc",
                     TinyFont::buildCollection({makeTiny("Tiny First", "Regular", 400, false, 5),
                                                makeTiny("Tiny Mono", "Regular", 400, false, 5)}));
        TinyFont variable = makeTiny("Tiny Axes", "Regular", 400, false, 5);
        variable.axes = {{{'w', 'g', 'h', 't'}, 200, 900}};
        folder.write("fonts/axes.ttf", variable.build());
        folder.write("fonts/bitmap.bdf", buildBitmapFont());
        folder.write("fonts/type1.pfa", buildTypeOne());
        configure(std::string(aliases) + anyNameRule + generics);
    }

    void configure(const std::string& rules) {
        folder.write("fonts.conf",
                     fontConfiguration(folder.path("fonts"), folder.path("cache"), rules));
        config = std::make_unique<FS_FontConfig>();
    }

    // Returns: the file and the face that a request finds, and the axes; "none" for an unknown
    // name.
    std::string find(const std::string& name, int weight = 400, bool italic = false,
                     int widthClass = 5) {
        const auto found = config->find(name, makeStyle(weight, italic, widthClass));
        if (!found) {
            return "none";
        }
        const std::filesystem::path file = found->request.source.path;
        return file.filename().string() + ' ' + std::to_string(found->request.faceIndex) +
               (found->request.axes ? ' ' + std::to_string(found->request.axes->weight) : "");
    }

    TempDir folder;
    SetVariable environment{"FONTCONFIG_FILE", folder.path("fonts.conf")};
    std::unique_ptr<FS_FontConfig> config;
};

} // namespace

TEST_F(FS_FontConfigTest, FamilyFullAndPostScriptNamesAreFound) {
    EXPECT_EQ(find("Tiny Sans"), "sans.ttf 0");
    EXPECT_EQ(find("tiny sans"), "sans.ttf 0");
    EXPECT_EQ(find("Tiny Sans Bold"), "sans-b.ttf 0");
    EXPECT_EQ(find("TinySerif-Roman"), "serif.ttf 0");
    EXPECT_EQ(find("Tiny Type One"), "type1.pfa 0");
}

TEST_F(FS_FontConfigTest, NameThatNobodyKnowsIsNotFound) {
    for (const char* name :
         {"Tiny Sanss", "Tiny", "Tiny Sans:bold", "Tiny Sans,serif", "Not Installed", "Regular",
          "Bold", "", " ", "\x01 no family", "\xFF\xFE", "*", "sans-serif,"}) {
        EXPECT_EQ(find(name), "none") << name;
    }
}

TEST_F(FS_FontConfigTest, GenericFamiliesAreAlwaysFound) {
    EXPECT_EQ(find("serif"), "serif.ttf 0");
    EXPECT_EQ(find("sans-serif"), "sans.ttf 0");
    EXPECT_EQ(find("sans-serif", 700), "sans-b.ttf 0");
    EXPECT_EQ(find("Monospace"), "mono.ttc 1");
    for (const char* name : {"cursive", "fantasy", "system-ui", "math", "emoji", "fangsong",
                             "ui-serif", "ui-sans-serif", "ui-monospace", "ui-rounded"}) {
        EXPECT_NE(find(name), "none") << name;
    }
}

TEST_F(FS_FontConfigTest, GenericFamiliesNeedNoRules) {
    configure("");
    EXPECT_NE(find("serif"), "none");
    EXPECT_NE(find("cursive"), "none");
    EXPECT_EQ(find("Old Face"), "none");
}

TEST_F(FS_FontConfigTest, AliasesThatTheConfigurationDeclaresAreFound) {
    EXPECT_EQ(find("Old Face"), "mono.ttc 1");
    EXPECT_EQ(find("old face"), "mono.ttc 1");
    EXPECT_EQ(find("plain"), "serif.ttf 0");
}

TEST_F(FS_FontConfigTest, AliasOfAGenericFamilyIsFoundThoughEveryNameEndsThere) {
    EXPECT_EQ(find("Kind Of Sans"), "sans.ttf 0");
    EXPECT_EQ(find("Kind Of Sans", 400, true), "sans-i.ttf 0");
    EXPECT_EQ(find("Kind Of Mono"), "mono.ttc 1");
}

TEST_F(FS_FontConfigTest, AliasWhoseTargetIsNotInstalledIsNotFound) {
    EXPECT_EQ(find("Lost Face"), "none");
}

TEST_F(FS_FontConfigTest, WeightSlantAndWidthChooseTheFace) {
    EXPECT_EQ(find("Tiny Sans", 800), "sans-b.ttf 0");
    EXPECT_EQ(find("Tiny Sans", 500), "sans.ttf 0");
    EXPECT_EQ(find("Tiny Sans", 400, true), "sans-i.ttf 0");
    EXPECT_EQ(find("Tiny Sans", 400, false, 2), "sans-c.ttf 0");
    EXPECT_EQ(find("Tiny Sans", 400, false, 8), "sans.ttf 0");
}

TEST_F(FS_FontConfigTest, FaceOfACollectionIsFoundByItsName) {
    EXPECT_EQ(find("Tiny First"), "mono.ttc 0");
    EXPECT_EQ(find("Tiny Mono"), "mono.ttc 1");
}

TEST_F(FS_FontConfigTest, VariableFontIsAskedForTheWantedWeight) {
    EXPECT_EQ(find("Tiny Axes", 650), "axes.ttf 0 650");
    const auto found = config->find("Tiny Axes", makeStyle(650, false, 5));
    ASSERT_TRUE(found);
    const auto face = FS_FoundFace::open(*found);
    ASSERT_TRUE(face);
    EXPECT_EQ(face->style.weight, 650);
    EXPECT_EQ(utf8(face->familyName), "Tiny Axes");
}

TEST_F(FS_FontConfigTest, InstanceOfAVariableFontIsFoundByItsFullName) {
    std::filesystem::copy_file(fontFile("AdobeVFPrototype-Subset.otf"),
                               folder.path("fonts/adobe.otf"));
    configure("");
    const auto found =
        config->find("Adobe Variable Font Prototype Semibold", makeStyle(400, false, 5));
    ASSERT_TRUE(found);
    EXPECT_FALSE(found->request.axes);
    const auto instance = FS_FoundFace::open(*found);
    ASSERT_TRUE(instance);
    EXPECT_EQ(utf8(instance->familyName), "Adobe Variable Font Prototype Semibold");
    EXPECT_GT(instance->style.weight, 500);
    EXPECT_EQ(find("Adobe Variable Font Prototype", 650), "adobe.otf 0 650");
}

TEST_F(FS_FontConfigTest, OutlinesGoBeforeBitmapsOfTheSameName) {
    EXPECT_EQ(find("Tiny Bitmap"), "bitmap.bdf 0");
    folder.write("fonts/zz.ttf", makeTiny("Tiny Bitmap", "Regular", 400, false, 5).build());
    configure("");
    EXPECT_EQ(find("Tiny Bitmap"), "zz.ttf 0");
}

TEST_F(FS_FontConfigTest, SystemWithoutFontsFindsNothing) {
    std::filesystem::remove_all(folder.path("fonts"));
    configure(generics);
    EXPECT_EQ(find("Tiny Sans"), "none");
    EXPECT_EQ(find("serif"), "none");
}

TEST_F(FS_FontConfigTest, FontsInstalledLaterAreSeenAfterTheRescanInterval) {
    configure("<config><rescan><int>1</int></rescan></config>");
    EXPECT_EQ(config->getRescanInterval(), std::chrono::seconds(1));
    FS_SystemFonts fonts;
    const FS_FaceStyle regular;
    EXPECT_FALSE(fonts.find(u"Tiny New", regular));
    EXPECT_TRUE(fonts.find(u"Tiny Sans", regular));
    std::this_thread::sleep_for(std::chrono::milliseconds(1100)); // fontconfig counts in seconds
    folder.write("fonts/new.ttf", makeTiny("Tiny New", "Regular", 400, false, 5).build());
    bool found = false;
    for (int i = 0; i < 60 && !found; ++i) {
        std::this_thread::sleep_for(std::chrono::milliseconds(100));
        found = fonts.find(u"Tiny New", regular).has_value();
    }
    EXPECT_TRUE(found);
}

TEST_F(FS_FontConfigTest, RescanIntervalOfNoneMeansNever) {
    configure("<config><rescan><int>0</int></rescan></config>");
    EXPECT_GT(config->getRescanInterval(), std::chrono::hours(1000));
    EXPECT_TRUE(config->isUpToDate());
}
