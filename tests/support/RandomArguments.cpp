// The arguments of random calls, and the options of their documents.
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "tests/support/RandomCalls.h"

#include <bit>
#include <limits>

namespace DrawmereTest {
namespace {

using Limits = std::numeric_limits<float>;

constexpr float oddReals[] = {
    0.0F,
    -0.0F,
    1.0F,
    Limits::quiet_NaN(),
    Limits::infinity(),
    -Limits::infinity(),
    Limits::denorm_min(),
    Limits::max(),
    Limits::lowest(),
    32769.0F,
};

constexpr const char16_t* oddTexts[] = {
    u"",          u"none",    u"a",     u"#a",        u"#Mox-SVG-page-1",        u"Mox-SVG-page-2",
    u"]]><&\"'>", u"\t\n\r ", u"\x0b]", u"\xd800\xb", u"\xdc00\xd83d\xde00\xfe", u"\xffff\xfffe",
};

constexpr const char16_t* tameTexts[] = {
    u"none", u"#a", u"a", u"A line of text", u"#Mox-SVG-page-1", u"http://www.example.com/", u"b1",
};

constexpr SVGConfig::SVGTYPE profiles[] = {
    SVGConfig::SVGTYPE_FULL,    SVGConfig::SVGTYPE_BASIC, SVGConfig::SVGTYPE_TINY,
    SVGConfig::SVGTYPE_PLAZMIC, SVGConfig::SVGTYPE_WISP,
};

constexpr const char16_t* saveOptions[] = {
    u"", u"indent", u"decimals=2", u"indent,decimals=0", u",,decimals=99999999999,=",
};

constexpr const char16_t* imageWords[] = {u"embed-all", u"link", u"copy-all", u"copy", u"none"};
constexpr const char16_t* conversionWords[] = {u"auto", u"jpg", u"jpg-all", u"png", u"png-all"};

constexpr MoxCommonNS::MoxNameEnum linkKeys[] = {
    MoxCommonNS::MOXNAME_INTERNAL, MoxCommonNS::MOXNAME_EXTERNAL, MoxCommonNS::MOXNAME_SHOW,
    MoxCommonNS::MOXNAME_PAGE,     MoxCommonNS::MOXNAME_ID,       MoxCommonNS::MOXNAME_NAME,
};

} // namespace

void RandomCalls::configure(SVGConfig& config) {
    config.saveOption = pick(saveOptions);
    config.svgType = temper != WILD ? pick(profiles) : make<SVGConfig::SVGTYPE>();
    config.svgVersion = temper != WILD ? u"1.1" : make<UnicodeString>();
    config.wispMode = flag();
    config.colorFlag = flag();
    config.imageBaseUri = make<UnicodeString>();
    config.setImageProcessingType(MoxName(pick(imageWords)));
    config.setImageConversion(MoxName(pick(conversionWords)));
    config.svgOutputUri = directory.uri("page.svg"); // copies go beside it
    config.jpegQuality = make<int>();
    config.downsampleDpi = make<int>();
    config.downsampleThreshold = make<int>();
    config.downsampleType = make<int>();
    config.setEmbedFonts(make<UnicodeString>());
    config.adjustConfig();
}

template <> bool RandomCalls::make<bool>() { return flag(); }

template <> float RandomCalls::make<float>() {
    if (temper != WILD || flag()) {
        return static_cast<float>(below(2000)) / 10.0F - 50.0F;
    }
    return flag() ? pick(oddReals) : std::bit_cast<float>(number());
}

template <> UnicodeString RandomCalls::make<UnicodeString>() {
    if (!ids.empty() && below(4) == 0) {
        return ids[below(static_cast<unsigned>(ids.size()))];
    }
    UnicodeString text = temper != WILD ? pick(tameTexts) : pick(oddTexts);
    if (temper == WILD) {
        for (unsigned more = flag() ? 0 : below(12); more > 0; --more) {
            text.append(static_cast<char16_t>(below(flag() ? 0x80 : 0x10000)));
        }
        if (below(50) == 49) {
            text.setToBogus();
        }
    }
    madeTexts.push_back(text);
    return text;
}

template <> MoxLength RandomCalls::make<MoxLength>() { return MoxLength::fromRaw(make<float>()); }

template <> MoxPointT<MoxLength> RandomCalls::make<MoxPointT<MoxLength>>() {
    return {make<MoxLength>(), make<MoxLength>()};
}

template <> MoxRectT<MoxLength> RandomCalls::make<MoxRectT<MoxLength>>() {
    return {make<MoxPointT<MoxLength>>(), make<MoxPointT<MoxLength>>()};
}

template <> MoxColor RandomCalls::make<MoxColor>() { return make<unsigned>(); }

template <> MoxName RandomCalls::make<MoxName>() {
    const bool isNumber = temper == WILD && flag();
    return isNumber ? MoxName::fromNumber(make<unsigned>()) : MoxName(make<UnicodeString>());
}

// Compilers differ in the order in which they make the arguments of a call. What is made between
// braces, or in a line of its own, is made in the order in which it is written.

template <> MoxValue RandomCalls::make<MoxValue>() {
    MoxCommonNS::MoxNamedValueMap map;
    const auto add = [&](const auto& value) { map.setNamedItem(pick(linkKeys), value); };
    add(make<UnicodeString>());
    add(make<MoxName>());
    add(make<int>());
    MoxCommonNS::MoxNamedValueMap outer;
    outer.setNamedItem(pick(linkKeys), map);
    return flag() ? MoxValue(outer) : MoxValue(map);
}

template <> SVGMatrix RandomCalls::make<SVGMatrix>() {
    return {make<float>(), make<float>(), make<float>(),
            make<float>(), make<float>(), make<float>()};
}

template <> SVGFont RandomCalls::make<SVGFont>() {
    const UnicodeString name = make<UnicodeString>();
    const UnicodeString variant = make<UnicodeString>();
    const auto size = make<MoxLength>();
    constexpr FONTWEIGHT weights[] = {FONTWEIGHT_NORMAL, FONTWEIGHT_BOLD};
    const auto weight = temper == ORDERLY ? pick(weights) : make<FONTWEIGHT>();
    const auto style = make<FSTYLE>();
    const bool isVertical = flag();
    const bool isEmbedded = flag();
    SVGFont font;
    font.setFontAttribute(name, size, weight, style, variant, isVertical);
    font.setEmbedAttribute(isEmbedded, flag());
    font.setFontStretch(make<FONTSTRECH>());
    return font;
}

} // namespace DrawmereTest
