#include "SVGFont.h"
#include "foundation/common/MoxUtil.h"
#include "foundation/common/MoxValue.h"
#include "foundation/common/MoxWord.h"

namespace DrawmereNS {
namespace {

using MoxCommonNS::findWord;
using MoxCommonNS::MoxUtil;
using MoxCommonNS::MoxValue;
using MoxCommonNS::MoxWord;

constexpr FONTWEIGHT lightestWeight = 1;
constexpr FONTWEIGHT heaviestWeight = 1000;

constexpr MoxWord<float> sizeWords[] = {
    {FONTSIZE_XXSMALL.getRawValue(), u"xx-small"}, {FONTSIZE_XSMALL.getRawValue(), u"x-small"},
    {FONTSIZE_SMALL.getRawValue(), u"small"},      {FONTSIZE_MEDIUM.getRawValue(), u"medium"},
    {FONTSIZE_LARGE.getRawValue(), u"large"},      {FONTSIZE_XLARGE.getRawValue(), u"x-large"},
    {FONTSIZE_XXLARGE.getRawValue(), u"xx-large"}, {FONTSIZE_LARGER.getRawValue(), u"larger"},
    {FONTSIZE_SMALLER.getRawValue(), u"smaller"},
};

constexpr MoxWord<FSTYLE> styleWords[] = {
    {FSTYLE_ITALIC, u"italic"},
    {FSTYLE_OBLIQUE, u"oblique"},
};

constexpr MoxWord<FVARIANT> variantWords[] = {
    {FVARIANT_SMALLCAPS, u"small-caps"},
};

constexpr MoxWord<FONTSTRECH> stretchWords[] = {
    {FONTSTRECH_WIDER, u"wider"},
    {FONTSTRECH_NARROWER, u"narrower"},
    {FONTSTRECH_ULTRACONDENSED, u"ultra-condensed"},
    {FONTSTRECH_EXTRACONDENSED, u"extra-condensed"},
    {FONTSTRECH_CONDENSED, u"condensed"},
    {FONTSTRECH_SEMICONDENSED, u"semi-condensed"},
    {FONTSTRECH_SEMIEXPANDED, u"semi-expanded"},
    {FONTSTRECH_EXPANDED, u"expanded"},
    {FONTSTRECH_EXTRAEXPANDED, u"extra-expanded"},
    {FONTSTRECH_ULTRAEXPANDED, u"ultra-expanded"},
};

const char16_t* orNormal(const char16_t* word) { return word ? word : u"normal"; }

UnicodeString numberText(MoxLength length) {
    return MoxValue(length.getRealValue(MoxCommonNS::MOXUNIT_POINT)).toString();
}

UnicodeString sizeText(MoxLength size) {
    const char16_t* word = findWord(sizeWords, size.getRawValue());
    return word ? UnicodeString(word) : numberText(size);
}

UnicodeString adjustText(MoxLength adjust) {
    return adjust == FONTADJUST_NONE ? UnicodeString(u"none") : numberText(adjust);
}

UnicodeString weightText(FONTWEIGHT weight) {
    // On purpose: 400 is written as a number; "normal" here would take font-weight off every text.
    const bool printable = weight >= lightestWeight && weight <= heaviestWeight;
    return printable ? MoxUtil::toString(weight) : UnicodeString(u"normal");
}

} // namespace

void SVGFontAttr2String::getFontAttrStr(const FONTATTRIBUTE& font, FONTATTRSTRING& out) {
    out.fontName = font.fontName;
    out.fontSize = sizeText(font.fontSize);
    out.fontWeight = weightText(font.fontWeight);
    out.fontStyle = orNormal(findWord(styleWords, font.fontStyle));
    out.fontFamily = font.fontFamily;
    out.fontAdjust = adjustText(font.fontAdjust);
    out.fontVariant = orNormal(findWord(variantWords, font.fontVariant));
    out.fontStretch = orNormal(findWord(stretchWords, font.fontStretch));
}

} // namespace DrawmereNS
