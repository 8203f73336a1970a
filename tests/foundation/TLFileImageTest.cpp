#include "foundation/records/TLFileImage.h"

#include "tests/support/TempDir.h"
#include "tests/support/Utf8.h"

#include <istream>

#include <gtest/gtest.h>

using namespace TalGraphic;
using DrawmereTest::TempDir;
using DrawmereTest::utf8;

TEST(TLFileImage, PathIsTheNameAsItIsGiven) {
    EXPECT_EQ(utf8(TLFileImage(u"file:///a%20b.png").getOrgFileName()), "file:///a%20b.png");
}

TEST(TLFileImage, FileIsOpenedOnceByPathOrUri) {
    const TempDir directory;
    directory.write("a.dat", "\xFF\xD8\xFF.");
    for (const UnicodeString& path :
         {directory.uri("a.dat"), UnicodeString(u"file://") + directory.uri("a.dat")}) {
        TLFileImage image(path);
        std::istream* const stream = image.getStream();
        ASSERT_TRUE(stream);
        EXPECT_EQ(image.getStream(), stream);
        EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_JPEG);
        EXPECT_EQ(stream->get(), 0xFF);
    }
}

TEST(TLFileImage, MissingFileHasNeitherStreamNorType) {
    const TempDir directory;
    for (const UnicodeString& path : {directory.uri("missing.png"), directory.uri()}) {
        TLFileImage image(path);
        EXPECT_FALSE(image.getStream());
        EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_OTHER);
    }
}

TEST(TLFileImage, FileMayComeLater) {
    const TempDir directory;
    TLFileImage image(directory.uri("late.svg"));
    EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_OTHER);
    directory.write("late.svg", "<svg/>");
    EXPECT_EQ(image.getGraphicType(), TLGRAPHICTYPE_SVG);
}
