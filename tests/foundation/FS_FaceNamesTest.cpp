#include "foundation/fontservice/FS_FaceNames.h"

#include "foundation/fontservice/FS_Face.h"
#include "tests/support/TinyFont.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

using namespace DrawmereTest;
using namespace MoxFontService_NS;

namespace {

// Returns: the names of a font in memory, the family name first.
std::vector<std::string> readNamesOf(const std::string& bytes) {
    FS_FaceRequest request;
    request.source.bytes = std::make_shared<const std::string>(bytes);
    const std::shared_ptr<FS_Face> face = FS_Face::open(request);
    std::vector<std::string> names;
    for (const UnicodeString& name : face->readAllNames()) {
        names.push_back(utf8(name));
    }
    if (!names.empty()) {
        EXPECT_EQ(names.front(), utf8(face->familyName));
    }
    return names;
}

using Names = std::vector<std::string>;

} // namespace

TEST(FS_FaceNames, EachNameIsReadOnce) {
    TinyFont tiny("Tiny");
    tiny.style = "Bold";
    tiny.postScriptName = "Tiny-Bold";
    EXPECT_EQ(readNamesOf(tiny.build()), (Names{"Tiny", "Tiny Bold", "Tiny-Bold"}));
    EXPECT_EQ(readNamesOf(TinyFont("Tiny").build()), (Names{"Tiny"}));
    EXPECT_EQ(readNamesOf(TinyFont("").build()), Names());
}

TEST(FS_FaceNames, FamilyNameIsTheOneThatTellsWidthsApart) {
    TinyFont tiny("Tiny Condensed");
    tiny.typographicFamily = "Tiny";
    EXPECT_EQ(readNamesOf(tiny.build()), (Names{"Tiny Condensed", "Tiny"}));
}

TEST(FS_FaceNames, EnglishNameGoesBeforeThoseOfOtherLanguages) {
    TinyFont tiny("Tiny");
    tiny.foreignFamily = "Winzig";
    EXPECT_EQ(readNamesOf(tiny.build()), (Names{"Tiny", "Winzig"}));
    tiny.family = "";
    EXPECT_EQ(readNamesOf(tiny.build()), (Names{"Winzig"}));
}

TEST(FS_FaceNames, TypeOneFontsHaveNamesToo) {
    EXPECT_EQ(readNamesOf(buildTypeOne()), (Names{"Tiny Type One", "TinyTypeOne"}));
}
