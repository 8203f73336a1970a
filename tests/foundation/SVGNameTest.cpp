#include "foundation/names/SVGName.h"

#include <gtest/gtest.h>
#include <string>
#include <string_view>
#include <vector>

namespace {

using MoxCommonNS::MoxName;
using MoxCommonNS::MoxNameEnum;
using MoxCommonNS::MoxNameTable;
using MoxCommonNS::UnicodeString;
using TalCommon::SVGName;

struct Row {
    SVGName::Number number;
    std::u16string_view text;
};

constexpr Row rows[] = {
#define SVG_NAME(identifier, text) {SVGName::identifier, text},
#include "foundation/names/SVGName.def"
#undef SVG_NAME
};

// What the DTD of SVG 1.1 (Second Edition) declares, names with a prefix aside.
constexpr std::u16string_view elements =
    u"a altGlyph altGlyphDef altGlyphItem animate animateColor animateMotion "
    u"animateTransform circle clipPath color-profile cursor defs desc ellipse feBlend "
    u"feColorMatrix feComponentTransfer feComposite feConvolveMatrix feDiffuseLighting "
    u"feDisplacementMap feDistantLight feFlood feFuncA feFuncB feFuncG feFuncR "
    u"feGaussianBlur feImage feMerge feMergeNode feMorphology feOffset fePointLight "
    u"feSpecularLighting feSpotLight feTile feTurbulence filter font font-face "
    u"font-face-format font-face-name font-face-src font-face-uri foreignObject g glyph "
    u"glyphRef hkern image line linearGradient marker mask metadata missing-glyph mpath path "
    u"pattern polygon polyline radialGradient rect script set stop style svg switch symbol "
    u"text textPath title tref tspan use view vkern ";

constexpr std::u16string_view attributes =
    u"accent-height accumulate additive alignment-baseline alphabetic amplitude arabic-form "
    u"ascent attributeName attributeType azimuth baseFrequency baseProfile baseline-shift "
    u"bbox begin bias by calcMode cap-height class clip clip-path clip-rule clipPathUnits "
    u"color color-interpolation color-interpolation-filters color-profile color-rendering "
    u"contentScriptType contentStyleType cursor cx cy d descent diffuseConstant direction "
    u"display divisor dominant-baseline dur dx dy edgeMode elevation enable-background end "
    u"exponent externalResourcesRequired fill fill-opacity fill-rule filter filterRes "
    u"filterUnits flood-color flood-opacity font-family font-size font-size-adjust "
    u"font-stretch font-style font-variant font-weight format from fx fy g1 g2 glyph-name "
    u"glyph-orientation-horizontal glyph-orientation-vertical glyphRef gradientTransform "
    u"gradientUnits hanging height horiz-adv-x horiz-origin-x horiz-origin-y id ideographic "
    u"image-rendering in in2 intercept k k1 k2 k3 k4 kernelMatrix kernelUnitLength kerning "
    u"keyPoints keySplines keyTimes lang lengthAdjust letter-spacing lighting-color "
    u"limitingConeAngle local marker-end marker-mid marker-start markerHeight markerUnits "
    u"markerWidth mask maskContentUnits maskUnits mathematical max media method min mode "
    u"name numOctaves offset onabort onactivate onbegin onclick onend onerror onfocusin "
    u"onfocusout onload onmousedown onmousemove onmouseout onmouseover onmouseup onrepeat "
    u"onresize onscroll onunload onzoom opacity operator order orient orientation origin "
    u"overflow overline-position overline-thickness panose-1 path pathLength "
    u"patternContentUnits patternTransform patternUnits pointer-events points pointsAtX "
    u"pointsAtY pointsAtZ preserveAlpha preserveAspectRatio primitiveUnits r radius refX "
    u"refY rendering-intent repeatCount repeatDur requiredExtensions requiredFeatures "
    u"restart result rotate rx ry scale seed shape-rendering slope spacing specularConstant "
    u"specularExponent spreadMethod startOffset stdDeviation stemh stemv stitchTiles "
    u"stop-color stop-opacity strikethrough-position strikethrough-thickness string stroke "
    u"stroke-dasharray stroke-dashoffset stroke-linecap stroke-linejoin stroke-miterlimit "
    u"stroke-opacity stroke-width style surfaceScale systemLanguage tableValues target "
    u"targetX targetY text-anchor text-decoration text-rendering textLength title to "
    u"transform type u1 u2 underline-position underline-thickness unicode unicode-bidi "
    u"unicode-range units-per-em v-alphabetic v-hanging v-ideographic v-mathematical values "
    u"version vert-adv-y vert-origin-x vert-origin-y viewBox viewTarget visibility width "
    u"widths word-spacing writing-mode x x-height x1 x2 xChannelSelector y y1 y2 "
    u"yChannelSelector z zoomAndPan ";

std::vector<UnicodeString> wordsOf(std::u16string_view list) {
    std::vector<UnicodeString> words;
    for (std::size_t end = list.find(u' '); end != std::u16string_view::npos;
         end = list.find(u' ')) {
        words.emplace_back(list.data(), static_cast<std::int32_t>(end));
        list.remove_prefix(end + 1);
    }
    return words;
}

std::string textOf(MoxName name) {
    std::string bytes;
    return MoxNameTable::getSharedNameString(name).toUTF8String(bytes);
}

void expectListed(const std::vector<UnicodeString>& words) {
    for (const UnicodeString& word : words) {
        const SVGName name{MoxName(word)};
        std::string bytes;
        EXPECT_NE(name, SVGName::unknown) << word.toUTF8String(bytes);
    }
}

TEST(SVGName, ListsAllElementsOfSvg) {
    const auto words = wordsOf(elements);
    EXPECT_EQ(words.size(), 80U);
    expectListed(words);
}

TEST(SVGName, ListsAllAttributesOfSvg) {
    const auto words = wordsOf(attributes);
    EXPECT_EQ(words.size(), 256U);
    expectListed(words);
}

TEST(SVGName, CountsNamesOfElementsAndAttributesOnce) {
    EXPECT_EQ(std::size(rows), 328U);
    EXPECT_EQ(SVGName::count_, 329);
    EXPECT_EQ(SVGName::a, 1);
}

TEST(SVGName, EveryNameConvertsToItsTextAndBack) {
    for (const Row& row : rows) {
        const UnicodeString text(row.text.data(), static_cast<std::int32_t>(row.text.size()));
        const MoxName shared = SVGName(row.number);
        EXPECT_EQ(MoxNameTable::getSharedNameString(shared), text) << textOf(shared);
        EXPECT_EQ(MoxName(text), shared) << textOf(shared);
        EXPECT_EQ(SVGName(shared).getNumber(), row.number) << textOf(shared);
    }
}

TEST(SVGName, NameWithAFixedNumberKeepsIt) {
    const struct {
        SVGName::Number number;
        std::uint32_t shared;
    } fixedNames[] = {
        {SVGName::alphabetic, 250}, {SVGName::id, 1069},   {SVGName::svg, 1431},
        {SVGName::target, 1506},    {SVGName::name, 1552},
    };

    for (const auto& fixed : fixedNames) {
        EXPECT_EQ(MoxName(SVGName(fixed.number)).number, fixed.shared);
        EXPECT_EQ(SVGName(MoxName::fromNumber(fixed.shared)).getNumber(), fixed.number);
    }
}

TEST(SVGName, OtherNamesAreNumberedByTheirPlaceFromTheFirstFreeNumber) {
    EXPECT_EQ(MoxName(SVGName(SVGName::a)).number, 4096U);
    EXPECT_EQ(MoxName(SVGName(SVGName::zoomAndPan)).number, 4096U + SVGName::zoomAndPan - 1);
}

TEST(SVGName, WhatIsNoNameOfSvgIsUnknown) {
    EXPECT_EQ(SVGName(MoxName()), SVGName::unknown);
    EXPECT_EQ(SVGName(MoxName(UnicodeString(u"no-such-name"))), SVGName::unknown);
    EXPECT_EQ(SVGName(MoxName(UnicodeString(u"xlink:href"))), SVGName::unknown);
    EXPECT_EQ(SVGName(MoxName(MoxCommonNS::MOXNAME_LR_TB)), SVGName::unknown);
    for (const std::uint32_t number : {4095U, 4096U + 328U, 0xFFFFFFFFU}) {
        EXPECT_EQ(SVGName(MoxName::fromNumber(number)), SVGName::unknown) << number;
    }
}

TEST(SVGName, PlaceOfANameWithAFixedNumberBelongsToNoName) {
    const auto unused = MoxName::fromNumber(4096U + SVGName::svg - 1);
    EXPECT_EQ(SVGName(unused), SVGName::unknown);
    EXPECT_EQ(textOf(unused), "");
}

TEST(SVGName, UnknownIsNoName) {
    EXPECT_EQ(MoxName(SVGName()), MoxName());
    EXPECT_EQ(SVGName().getNumber(), SVGName::unknown);
}

TEST(SVGName, NumberBeyondTheListIsUnknown) {
    EXPECT_EQ(SVGName(SVGName::count_), SVGName::unknown);
    EXPECT_EQ(SVGName(static_cast<SVGName::Number>(0xFFFF)), SVGName::unknown);
}

TEST(SVGName, HyphenAndCapitalAreDifferentNames) {
    EXPECT_NE(SVGName(SVGName::clip_path), SVGName(SVGName::clipPath));
    EXPECT_EQ(textOf(SVGName(SVGName::clip_path)), "clip-path");
    EXPECT_EQ(textOf(SVGName(SVGName::clipPath)), "clipPath");
    EXPECT_EQ(textOf(SVGName(SVGName::class_)), "class");
}

} // namespace
