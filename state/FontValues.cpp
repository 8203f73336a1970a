#include "state/FontValues.h"

#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxWord.h"

namespace DrawmereNS {
namespace {

using MoxCommonNS::findWord;
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

MoxValue makeNumberText(MoxLength length) {
    char text[MoxCommonNS::maxRealText];
    const float number = length.getRealValue(MoxCommonNS::MOXUNIT_POINT);
    return MoxValue::fromAscii({text, MoxCommonNS::writeReal(number, text)});
}

} // namespace

MoxValue makeFontSizeValue(MoxLength size) {
    const char16_t* word = findWord(sizeWords, size.getRawValue());
    return word ? MoxValue(word) : makeNumberText(size);
}

MoxValue makeFontAdjustValue(MoxLength adjust) {
    return adjust == FONTADJUST_NONE ? MoxValue(u"none") : makeNumberText(adjust);
}

MoxValue makeFontWeightValue(FONTWEIGHT weight) {
    // On purpose: 400 is written as a number; "normal" here would take font-weight off every text.
    if (weight < lightestWeight || weight > heaviestWeight) {
        return u"normal";
    }
    char text[MoxCommonNS::maxIntegerText];
    return MoxValue::fromAscii({text, MoxCommonNS::writeInteger(weight, text)});
}

const char16_t* findFontStyleWord(FSTYLE style) { return findWord(styleWords, style); }

const char16_t* findFontStretchWord(FONTSTRECH stretch) { return findWord(stretchWords, stretch); }

const char16_t* getFontStyleWord(FSTYLE style) { return orNormal(findFontStyleWord(style)); }

const char16_t* getFontVariantWord(FVARIANT variant) {
    return orNormal(findWord(variantWords, variant));
}

const char16_t* getFontStretchWord(FONTSTRECH stretch) {
    return orNormal(findFontStretchWord(stretch));
}

} // namespace DrawmereNS
