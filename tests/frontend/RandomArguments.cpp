// The arguments of random calls, and the options of their documents.
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxNamedValueMap.h"
#include "tests/frontend/RandomCalls.h"

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
    config.svgType = make<SVGConfig::SVGTYPE>();
    config.svgVersion = make<UnicodeString>();
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
    const float odd = pick(oddReals);
    const float usual = static_cast<float>(below(2000)) / 10.0F - 50.0F;
    const float any = std::bit_cast<float>(static_cast<std::uint32_t>(numbers()));
    return flag() ? usual : flag() ? odd : any;
}

template <> UnicodeString RandomCalls::make<UnicodeString>() {
    UnicodeString text = pick(oddTexts);
    for (unsigned more = flag() ? below(12) : 0; more > 0; --more) {
        text.append(static_cast<char16_t>(below(flag() ? 0x80 : 0x10000)));
    }
    if (below(50) == 0) {
        text.setToBogus();
    }
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
    return flag() ? MoxName::fromNumber(make<unsigned>()) : MoxName(make<UnicodeString>());
}

template <> MoxValue RandomCalls::make<MoxValue>() {
    MoxCommonNS::MoxNamedValueMap map;
    map.setNamedItem(pick(linkKeys), make<UnicodeString>());
    map.setNamedItem(pick(linkKeys), make<MoxName>());
    map.setNamedItem(pick(linkKeys), make<int>());
    MoxCommonNS::MoxNamedValueMap outer;
    outer.setNamedItem(pick(linkKeys), map);
    return flag() ? MoxValue(outer) : MoxValue(map);
}

template <> SVGMatrix RandomCalls::make<SVGMatrix>() {
    return {make<float>(), make<float>(), make<float>(),
            make<float>(), make<float>(), make<float>()};
}

template <> SVGFont RandomCalls::make<SVGFont>() {
    SVGFont font;
    font.setFontAttribute(make<UnicodeString>(), make<MoxLength>(), make<FONTWEIGHT>(),
                          make<FSTYLE>(), make<UnicodeString>(), flag());
    font.setEmbedAttribute(flag(), flag());
    font.setFontStretch(make<FONTSTRECH>());
    return font;
}

} // namespace DrawmereTest
