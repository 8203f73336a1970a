#include "frontend/DrawmereError.h"

#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;

namespace {

struct TextRow {
    unsigned short code;
    const char* withArgument; // with the argument "/tmp/x"
    const char* without;
};

constexpr TextRow textRows[] = {
    {16404, "Change font name to family name error.", "Change font name to family name error."},
    {16405, "Create an encoding buffer error.", "Create an encoding buffer error."},
    {16406, "Pop a empty stack.", "Pop a empty stack."},
    {16407, "Pop type is not same with push type.", "Pop type is not same with push type."},
    {16408, "Append an element to a NULL tree.", "Append an element to a NULL tree."},
    {16410, "The svg output path (/tmp/x) doesn't exist.", "The svg output path doesn't exist."},
    {16411, "It is necessary to specify the uri that copies image files.",
     "It is necessary to specify the uri that copies image files."},
    {16412, "It is necessary to specify the uri that copies image files absolutely.",
     "It is necessary to specify the uri that copies image files absolutely."},
    {16413, "Specified uri that copies image files (/tmp/x) doesn't exists.",
     "Specified uri that copies image files doesn't exists."},
    {16414, "Specified uri that svg output (/tmp/x) couldn't create.",
     "Specified uri that svg output couldn't create."},
    {16417, "The image (/tmp/x) couldn't load.", "The image couldn't load."},
    {16418, "The image (/tmp/x) couldn't read.", "The image couldn't read."},
    {16419, "The copy image (/tmp/x) couldn't create.", "The copy image couldn't create."},
    {16420, "The Iimage (/tmp/x) isn't a raster image type.",
     "The Iimage isn't a raster image type."},
    {16421, "The Iimage (/tmp/x) isn't suppoeted type.", "The Iimage isn't suppoeted type."},
    {16423, "There is no alternative file for the maximum size error.",
     "There is no alternative file for the maximum size error."},
    {16424, "The size of the output file exceeded the limitation of a specified maximum.",
     "The size of the output file exceeded the limitation of a specified maximum."},
    {16425, "The image size height exceeded the limitation of a specified maximum.",
     "The image size height exceeded the limitation of a specified maximum."},
    {16426, "The number of pages exceeded the limitation of a specified maximum.",
     "The number of pages exceeded the limitation of a specified maximum."},
    {16428, "clipPath element is required. It is not supported with SVG Tiny.",
     "clipPath element is required. It is not supported with SVG Tiny."},
    {16429,
     "linerGradiant or radialGradiant element is required. It is not supported with SVG Tiny.",
     "linerGradiant or radialGradiant element is required. It is not supported with SVG Tiny."},
    {16430, "mask element is required. It is not supported with SVG Tiny.",
     "mask element is required. It is not supported with SVG Tiny."},
    {16431, "pattern element is required. It is not supported with SVG Tiny.",
     "pattern element is required. It is not supported with SVG Tiny."},
};

std::string text(unsigned short code, const char16_t* argument) {
    return utf8(DrawmereError::getErrorMessage(code, argument));
}

} // namespace

// On purpose: the spellings are what callers match and translate.
TEST(DrawmereError, TextOfEachCodeIsFixed) {
    for (const TextRow& row : textRows) {
        EXPECT_EQ(text(row.code, u"/tmp/x"), row.withArgument) << row.code;
        EXPECT_EQ(text(row.code, u""), row.without) << row.code;
    }
}

TEST(DrawmereError, CodeWithoutTextGivesTheGeneralOne) {
    for (const int code : {0, 1, 16403, 16409, 16415, 16416, 16422, 16427, 16432, 16929, 65535}) {
        EXPECT_EQ(text(static_cast<unsigned short>(code), u"text"), "Drawmere error!") << code;
        EXPECT_EQ(text(static_cast<unsigned short>(code), u""), "Drawmere error!") << code;
    }
}

TEST(DrawmereError, ArgumentIsShownAsItStands) {
    EXPECT_EQ(text(16417, u"a (b) ü.png"), "The image (a (b) ü.png) couldn't load.");
}

TEST(DrawmereError, ThrownRecordCarriesTheCodeOfItsText) {
    try {
        DrawmereError::throwError(16414, u"/tmp/x");
    } catch (const MoxError& error) {
        EXPECT_EQ(error.getCode(), 16414);
        EXPECT_EQ(utf8(error.getMessage()),
                  "Specified uri that svg output (/tmp/x) couldn't create.");
        EXPECT_TRUE(error.getSource().isEmpty());
        EXPECT_TRUE(error.getExtra().isEmpty());
        EXPECT_EQ(error.getLine(), -1);
        EXPECT_EQ(error.getColumn(), -1);
    }
}

TEST(DrawmereError, ThrowErrorDoesNotReturn) {
    EXPECT_THROW(DrawmereError::throwError(16406), MoxError);
    EXPECT_THROW(DrawmereError::throwError(1), MoxError);
}
