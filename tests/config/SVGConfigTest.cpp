#include "SVGConfig.h"

#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxObjectBase.h"
#include "tests/support/Utf8.h"

#include <cmath>
#include <limits>
#include <string>

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;
using MoxCommonNS::MoxNameTable;

namespace {

class CountedObject : public MoxCommonNS::MoxObjectBase {
public:
    CountedObject() = default;

    ~CountedObject() override { ++destroyedCount; }

    static inline int destroyedCount = 0;
};

std::string textOf(MoxName name) { return utf8(MoxNameTable::getSharedNameString(name)); }

std::string embedFonts(const UnicodeString& list) {
    SVGConfig config;
    config.setEmbedFonts(list);
    std::string names;
    for (const UnicodeString& font : config.embedFontNames) {
        names += "<" + utf8(font) + ">";
    }
    return names;
}

float adjustedLength(SVGConfig::SVGTYPE type, float length) {
    SVGConfig config;
    config.svgType = type;
    config.maxLength = length;
    config.adjustConfig();
    return config.maxLength;
}

void expectDefaultDocumentOptions(const SVGConfig& config) {
    EXPECT_EQ(utf8(config.encoding), "");
    EXPECT_EQ(config.svgType, SVGConfig::SVGTYPE_FULL);
    EXPECT_EQ(utf8(config.svgVersion), "1.1");
    EXPECT_EQ(utf8(config.numberFormatDefault), "1");
    EXPECT_TRUE(config.keepGroups);
    EXPECT_TRUE(config.unsetText.isBogus());
    EXPECT_EQ(utf8(config.saveOption), "");
    EXPECT_FALSE(config.reservedFlag);
    EXPECT_EQ(config.maxLength, 0.0F);
    EXPECT_EQ(config.limitValue, 5000);
    EXPECT_TRUE(config.colorFlag);
    EXPECT_FALSE(config.embedAllFonts);
    EXPECT_TRUE(config.embedFontNames.empty());
}

void expectDefaultOutputOptions(const SVGConfig& config) {
    EXPECT_FALSE(config.gzip);
    EXPECT_TRUE(config.streamOutput);
    EXPECT_FALSE(config.checkPaths);
    EXPECT_TRUE(config.svgOutputUri.isBogus());
    EXPECT_FALSE(config.singleFile);
    EXPECT_FALSE(config.wispMode);
    EXPECT_EQ(utf8(config.wispOptions), "");
    EXPECT_FALSE(config.keepPageNumber);
    EXPECT_EQ(config.ownedObject, nullptr);
    EXPECT_FALSE(config.ownsObject);
    EXPECT_TRUE(config.streamsByName.empty());
    EXPECT_TRUE(config.namesByStream.empty());
}

void expectDefaultImageOptions(const SVGConfig& config) {
    EXPECT_EQ(textOf(config.imageProcessingName), "embed-all");
    EXPECT_EQ(config.imageProcessing, 0);
    EXPECT_EQ(textOf(config.imageConversionName), "auto");
    EXPECT_EQ(config.imageConversion, 0);
    EXPECT_EQ(config.jpegQuality, 80);
    EXPECT_TRUE(config.imageBaseUri.isBogus());
    EXPECT_EQ(utf8(config.imageCopyUri), "./");
    EXPECT_EQ(config.downsampleDpi, 0);
    EXPECT_EQ(config.downsampleThreshold, 1);
    EXPECT_EQ(config.downsampleType, 1);
    EXPECT_EQ(utf8(config.copyNamePrefix), "");
    EXPECT_TRUE(config.enteredImageNames.empty());
    EXPECT_TRUE(config.imageNameMap.empty());
    EXPECT_EQ(config.copyNameCounter, 0);
}

void changeEverything(SVGConfig& config) {
    for (UnicodeString* text :
         {&config.encoding, &config.svgVersion, &config.numberFormatDefault, &config.unsetText,
          &config.imageBaseUri, &config.imageCopyUri, &config.svgOutputUri, &config.saveOption,
          &config.wispOptions, &config.copyNamePrefix}) {
        *text = u"changed";
    }
    for (bool* flag :
         {&config.gzip, &config.embedAllFonts, &config.keepGroups, &config.streamOutput,
          &config.checkPaths, &config.singleFile, &config.wispMode, &config.reservedFlag,
          &config.keepPageNumber, &config.ownsObject, &config.colorFlag}) {
        *flag = !*flag;
    }
    for (std::int32_t* number :
         {&config.jpegQuality, &config.downsampleDpi, &config.downsampleThreshold,
          &config.downsampleType, &config.copyNameCounter, &config.limitValue}) {
        *number = 7;
    }
    config.svgType = SVGConfig::SVGTYPE_PLAZMIC;
    config.maxLength = 7.0F;
    config.setImageConversion(MoxName(u"png"));
    config.setImageProcessingType(MoxName(u"copy"));
    config.setEmbedFonts(u"A");
    config.enterImageName(u"source", u"key", u"entered");
}

} // namespace

TEST(SVGConfig, ConstructorSetsTheDefaults) {
    const SVGConfig config;
    expectDefaultDocumentOptions(config);
    expectDefaultOutputOptions(config);
    expectDefaultImageOptions(config);
    EXPECT_TRUE(config.errors.empty());
    EXPECT_TRUE(config.createdFiles.empty());
}

TEST(SVGConfig, InitSetsTheDefaultsAgain) {
    SVGConfig config;
    changeEverything(config);
    config.init();
    expectDefaultDocumentOptions(config);
    expectDefaultOutputOptions(config);
    expectDefaultImageOptions(config);
}

// On purpose: init forgets the object and the streams without deleting them; errors and created
// files stay.
TEST(SVGConfig, InitLeavesErrorsAndCreatedFilesAndTheObjectAlone) {
    CountedObject object;
    const int before = CountedObject::destroyedCount;
    SVGConfig config;
    config.pushError(MoxError());
    config.streamOutput = false;
    config.entryCreatedFile(u"a.svg");
    config.ownedObject = &object;
    config.ownsObject = true;
    config.init();
    EXPECT_TRUE(config.hasError());
    EXPECT_EQ(config.createdFiles.size(), 1U);
    EXPECT_EQ(config.ownedObject, nullptr);
    EXPECT_EQ(CountedObject::destroyedCount, before);
}

// On purpose: reads nothing of its argument.
TEST(SVGConfig, CopyHasNothingOfTheOriginalAndNoDefaults) {
    SVGConfig original;
    changeEverything(original);
    original.pushError(MoxError());
    const SVGConfig copy(original); // NOLINT(performance-unnecessary-copy-initialization)
    for (const UnicodeString* text :
         {&copy.encoding, &copy.svgVersion, &copy.numberFormatDefault, &copy.unsetText,
          &copy.imageBaseUri, &copy.imageCopyUri, &copy.svgOutputUri, &copy.saveOption,
          &copy.wispOptions, &copy.copyNamePrefix}) {
        EXPECT_EQ(utf8(*text), "");
    }
    for (const bool flag : {copy.gzip, copy.embedAllFonts, copy.keepGroups, copy.streamOutput,
                            copy.checkPaths, copy.singleFile, copy.wispMode, copy.reservedFlag,
                            copy.keepPageNumber, copy.ownsObject, copy.colorFlag}) {
        EXPECT_FALSE(flag);
    }
    for (const std::int32_t number :
         {copy.jpegQuality, copy.downsampleDpi, copy.downsampleThreshold, copy.downsampleType,
          copy.copyNameCounter, copy.limitValue, copy.imageProcessing, copy.imageConversion}) {
        EXPECT_EQ(number, 0);
    }
    EXPECT_EQ(copy.svgType, SVGConfig::SVGTYPE_FULL);
    EXPECT_EQ(copy.maxLength, 0.0F);
    EXPECT_EQ(copy.imageProcessingName, MoxName());
    EXPECT_EQ(copy.imageConversionName, MoxName());
    EXPECT_TRUE(copy.embedFontNames.empty());
    EXPECT_TRUE(copy.enteredImageNames.empty());
    EXPECT_TRUE(copy.errors.empty());
}

TEST(SVGConfig, DestructorDeletesTheObjectOnlyWhenItOwnsIt) {
    CountedObject borrowed;
    const int before = CountedObject::destroyedCount;
    {
        SVGConfig config;
        config.ownedObject = &borrowed;
    }
    EXPECT_EQ(CountedObject::destroyedCount, before);
    {
        SVGConfig config;
        config.ownedObject = new CountedObject;
        config.ownsObject = true;
    }
    EXPECT_EQ(CountedObject::destroyedCount, before + 1);
}

TEST(SVGConfig, ProfilesHaveTheNumbersOfTheCallers) {
    EXPECT_EQ(static_cast<int>(SVGConfig::SVGTYPE_FULL), 0);
    EXPECT_EQ(static_cast<int>(SVGConfig::SVGTYPE_BASIC), 1);
    EXPECT_EQ(static_cast<int>(SVGConfig::SVGTYPE_TINY), 2);
    EXPECT_EQ(static_cast<int>(SVGConfig::SVGTYPE_WISP), 3);
    EXPECT_EQ(static_cast<int>(SVGConfig::SVGTYPE_PLAZMIC), 4);
}

// On purpose: the name loses the character before its comma, which the caller supplies as a blank.
TEST(SVGConfig, FontNameLosesTheCharacterBeforeItsComma) {
    EXPECT_EQ(embedFonts(u"Arial,Times"), "<Aria><Times>");
    EXPECT_EQ(embedFonts(u"Arial ,Times"), "<Arial><Times>");
    EXPECT_EQ(embedFonts(u"Arial  , Times New Roman ,Courier"),
              "<Arial><Courier><Times New Roman>");
    EXPECT_EQ(embedFonts(u"A,B"), "<B>");
    EXPECT_EQ(embedFonts(u"Arial,"), "<Aria>");
}

TEST(SVGConfig, EmptyEntriesOfTheFontListAreSkipped) {
    EXPECT_EQ(embedFonts(u""), "");
    EXPECT_EQ(embedFonts(u"  \t "), "");
    EXPECT_EQ(embedFonts(u","), "");
    EXPECT_EQ(embedFonts(u" , , "), "");
    EXPECT_EQ(embedFonts(u",,A"), "<A>");
    EXPECT_EQ(embedFonts(u" , ,  A  "), "<A>");
    EXPECT_EQ(embedFonts(u"A ,A"), "<A>");
}

TEST(SVGConfig, FontListReplacesTheOneBefore) {
    SVGConfig config;
    config.setEmbedFonts(u"A");
    config.setEmbedFonts(u"B");
    EXPECT_FALSE(config.isEmbedFont(u"A"));
    EXPECT_TRUE(config.isEmbedFont(u"B"));
    config.setEmbedFonts(u"");
    EXPECT_FALSE(config.isEmbedFont(u"B"));
}

TEST(SVGConfig, LongFontListIsReadInOneGo) {
    UnicodeString list;
    for (int i = 0; i < 500000; ++i) {
        list += u" ,";
    }
    EXPECT_EQ(embedFonts(list + u"A"), "<A>");
}

TEST(SVGConfig, FontNamesAreComparedExactly) {
    SVGConfig config;
    config.setEmbedFonts(u"Arial");
    EXPECT_TRUE(config.isEmbedFont(u"Arial"));
    EXPECT_FALSE(config.isEmbedFont(u"arial"));
    EXPECT_FALSE(config.isEmbedFont(u"Arial "));
    EXPECT_FALSE(config.isEmbedFont(u""));
    config.embedAllFonts = true;
    EXPECT_TRUE(config.isEmbedFont(u"anything"));
}

TEST(SVGConfig, AdjustedLengthKeepsLargeValuesOnlyInTheFullProfile) {
    EXPECT_EQ(adjustedLength(SVGConfig::SVGTYPE_FULL, 40000.0F), 40000.0F);
    EXPECT_EQ(adjustedLength(SVGConfig::SVGTYPE_TINY, 40000.0F), 32768.0F);
    EXPECT_EQ(adjustedLength(SVGConfig::SVGTYPE_TINY, 32768.0F), 32768.0F);
    EXPECT_EQ(adjustedLength(SVGConfig::SVGTYPE_TINY, 100.0F), 100.0F);
    EXPECT_EQ(adjustedLength(SVGConfig::SVGTYPE_FULL, 0.5F), 0.5F);
}

TEST(SVGConfig, OnlyTheFullProfileIsWithoutALimit) {
    for (const auto type : {SVGConfig::SVGTYPE_BASIC, SVGConfig::SVGTYPE_TINY,
                            SVGConfig::SVGTYPE_WISP, SVGConfig::SVGTYPE_PLAZMIC}) {
        EXPECT_EQ(adjustedLength(type, 40000.0F), 32768.0F) << type;
    }
    EXPECT_EQ(adjustedLength(SVGConfig::SVGTYPE_FULL, 40000.0F), 40000.0F);
}

TEST(SVGConfig, LengthThatIsNotPositiveBecomesTheLimit) {
    for (const auto type : {SVGConfig::SVGTYPE_FULL, SVGConfig::SVGTYPE_TINY}) {
        EXPECT_EQ(adjustedLength(type, 0.0F), 32768.0F);
        EXPECT_EQ(adjustedLength(type, -1.0F), 32768.0F);
        EXPECT_TRUE(std::isnan(adjustedLength(type, std::numeric_limits<float>::quiet_NaN())));
    }
}

TEST(SVGConfig, SmallDeviceModeOverrulesTheImageConversion) {
    SVGConfig config;
    config.setImageConversion(MoxName(u"png"));
    config.adjustConfig();
    EXPECT_EQ(config.imageConversion, 2);
    config.wispMode = true;
    config.adjustConfig();
    EXPECT_EQ(config.imageConversion, 3);
    EXPECT_EQ(textOf(config.imageConversionName), "jpg-all");
}

TEST(SVGConfig, ValueIsFoundByItsWholeKey) {
    struct Row {
        const char16_t* options;
        const char16_t* key;
        const char* value;
    };

    constexpr Row rows[] = {
        {u"maxsize=100,errorsvg=e.svg", u"errorsvg", "e.svg"},
        {u"maxsize=100,errorsvg=e.svg", u"maxsize", "100"},
        {u"amaxsize=100", u"maxsize", ""},
        {u"maxsize=1,maxsize=2", u"maxsize", "1"},
        {u"maxsize=", u"maxsize", ""},
        {u"maxsize", u"maxsize", ""},
        {u"MaxSize=1", u"maxsize", ""},
        {u"a=1, b=2", u"b", ""},
        {u"a= 1 ,b=2", u"a", " 1 "},
        {u"a=b=c,d=e", u"a", "b=c"},
        {u"", u"a", ""},
        {u"", u"", ""},
        {u"=x", u"", "x"},
    };
    const SVGConfig config;
    for (const Row& row : rows) {
        EXPECT_EQ(utf8(config.findValue(row.options, row.key)), row.value) << utf8(row.options);
    }
}

TEST(SVGConfig, NewestErrorIsPoppedFirst) {
    SVGConfig config;
    EXPECT_FALSE(config.hasError());
    config.pushError(MoxError(16929, u"one", u"", -1, -1, u""));
    config.pushError(MoxError(16931, u"two", u"", -1, -1, u""));
    EXPECT_TRUE(config.hasError());
    const MoxError newest = config.popError();
    EXPECT_EQ(newest.getCode(), 16931);
    EXPECT_EQ(utf8(newest.getMessage()), "two");
    EXPECT_EQ(config.popError().getCode(), 16929);
    EXPECT_FALSE(config.hasError());
}

TEST(SVGConfig, PopWithoutErrorsGivesAnEmptyRecord) {
    SVGConfig config;
    const MoxError none = config.popError();
    EXPECT_EQ(none.getCode(), 0);
    EXPECT_TRUE(none.getMessage().isEmpty());
}

TEST(SVGConfig, ErrorsCanBeDropped) {
    SVGConfig config;
    config.pushError(MoxError());
    config.pushError(MoxError());
    config.clearError();
    EXPECT_FALSE(config.hasError());
}
