#include "SVGConfig.h"

#include "foundation/common/MoxNameTable.h"
#include "foundation/records/TLGraphicImage.h"
#include "tests/support/Utf8.h"

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;
using MoxCommonNS::MoxNameTable;

namespace {

constexpr std::int32_t unlisted[] = {-1, 4, 99};

class FakeImage : public TalGraphic::TLGraphicImage {
public:
    FakeImage(int type, const UnicodeString& fileName)
        : TLGraphicImage(fileName), graphicType(static_cast<TalGraphic::TLGraphicType>(type)) {}

    TalGraphic::TLGraphicType getGraphicType() override { return graphicType; }

    std::istream* getStream() override { return nullptr; }

private:
    TalGraphic::TLGraphicType graphicType;
};

bool isEmbedded(std::int32_t processing, int type, const UnicodeString& fileName) {
    SVGConfig config;
    config.imageProcessing = processing;
    FakeImage image(type, fileName);
    return config.isEmbedImage(&image);
}

bool isCopied(std::int32_t processing, int type, const UnicodeString& fileName) {
    SVGConfig config;
    config.imageProcessing = processing;
    FakeImage image(type, fileName);
    return config.isCopyImage(&image);
}

} // namespace

TEST(SVGConfigImages, EmbedAllEmbedsEveryImage) {
    for (const int type : {0, 2, 5, 9}) {
        EXPECT_TRUE(isEmbedded(SVGConfig::IMAGEPROCESSING_EMBED_ALL, type, u"a"));
        EXPECT_TRUE(isEmbedded(SVGConfig::IMAGEPROCESSING_EMBED_ALL, type, u""));
        EXPECT_FALSE(isCopied(SVGConfig::IMAGEPROCESSING_EMBED_ALL, type, u"a"));
    }
}

TEST(SVGConfigImages, LinkLeavesFilesOfThreeTypesWhereTheyAre) {
    for (int type = -1; type < 12; ++type) {
        const bool isReferable = type == 2 || type == 5 || type == 9;
        EXPECT_EQ(isEmbedded(SVGConfig::IMAGEPROCESSING_LINK, type, u"a"), !isReferable) << type;
        EXPECT_TRUE(isEmbedded(SVGConfig::IMAGEPROCESSING_LINK, type, u"")) << type;
        EXPECT_FALSE(isCopied(SVGConfig::IMAGEPROCESSING_LINK, type, u"a")) << type;
    }
}

TEST(SVGConfigImages, CopyAllCopiesEveryImage) {
    for (const UnicodeString& fileName : {UnicodeString(u"a"), UnicodeString()}) {
        EXPECT_FALSE(isEmbedded(SVGConfig::IMAGEPROCESSING_COPY_ALL, 2, fileName));
        EXPECT_TRUE(isCopied(SVGConfig::IMAGEPROCESSING_COPY_ALL, 2, fileName));
    }
}

TEST(SVGConfigImages, CopySendsEachImageOneWay) {
    EXPECT_FALSE(isEmbedded(SVGConfig::IMAGEPROCESSING_COPY, 2, u"a"));
    EXPECT_TRUE(isCopied(SVGConfig::IMAGEPROCESSING_COPY, 2, u"a"));
    EXPECT_TRUE(isEmbedded(SVGConfig::IMAGEPROCESSING_COPY, 2, u""));
    EXPECT_FALSE(isCopied(SVGConfig::IMAGEPROCESSING_COPY, 2, u""));
}

TEST(SVGConfigImages, UnlistedProcessingAnswersBothWithYes) {
    for (const std::int32_t processing : unlisted) {
        EXPECT_TRUE(isEmbedded(processing, 2, u"a")) << processing;
        EXPECT_TRUE(isCopied(processing, 2, u"a")) << processing;
    }
}

TEST(SVGConfigImages, NullImageIsOneWithoutAFile) {
    SVGConfig config;
    for (const std::int32_t processing : {0, 1, 3}) {
        config.imageProcessing = processing;
        EXPECT_TRUE(config.isEmbedImage(nullptr)) << processing;
        EXPECT_FALSE(config.isCopyImage(nullptr)) << processing;
    }
}

TEST(SVGConfigImages, ImageProcessingIsSetByItsKeyword) {
    struct Row {
        const char16_t* keyword;
        int number;
    };

    constexpr Row rows[] = {
        {u"embed-all", 0}, {u"link", 1}, {u"copy-all", 2}, {u"copy", 3},
        {u"Embed-All", 0}, {u"Copy", 0}, {u"copy ", 0},    {u"nonsense", 0},
    };
    for (const Row& row : rows) {
        SVGConfig config;
        config.imageProcessing = 9;
        config.setImageProcessingType(MoxName(row.keyword));
        EXPECT_EQ(config.imageProcessing, row.number) << utf8(row.keyword);
        EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(config.imageProcessingName)),
                  utf8(row.keyword));
    }
}

TEST(SVGConfigImages, ImageConversionIsSetByItsKeyword) {
    struct Row {
        const char16_t* keyword;
        int number;
    };

    constexpr Row rows[] = {
        {u"auto", 0},    {u"jpeg", 1},    {u"jpg", 1}, {u"png", 2},      {u"jpg-all", 3},
        {u"png-all", 4}, {u"JPG-ALL", 0}, {u"gif", 0}, {u"jpeg-all", 0},
    };
    for (const Row& row : rows) {
        SVGConfig config;
        config.imageConversion = 9;
        config.setImageConversion(MoxName(row.keyword));
        EXPECT_EQ(config.imageConversion, row.number) << utf8(row.keyword);
        EXPECT_EQ(utf8(MoxNameTable::getSharedNameString(config.imageConversionName)),
                  utf8(row.keyword));
    }
}

TEST(SVGConfigImages, NoNameReadsAsTheFirstKeyword) {
    SVGConfig config;
    config.setImageConversion(MoxName(u"png"));
    config.setImageConversion(MoxName());
    config.setImageProcessingType(MoxName(u"copy"));
    config.setImageProcessingType(MoxName());
    EXPECT_EQ(config.imageConversion, 0);
    EXPECT_EQ(config.imageProcessing, 0);
    EXPECT_EQ(config.imageProcessingName, MoxName());
}
