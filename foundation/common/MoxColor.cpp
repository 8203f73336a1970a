#include "foundation/common/MoxColor.h"

#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxWord.h"

#include <cmath>
#include <string_view>

namespace MoxCommonNS {
namespace {

constexpr MoxWord<std::uint32_t> htmlColorWords[] = {
#define MOX_COLOR(rgb, text) {rgb, text},
#include "foundation/common/MoxHtmlColors.def"
#undef MOX_COLOR
};

constexpr std::size_t longColorText = 7; // "#rrggbb"

/// Returns: the number of characters written to `out`.
std::int32_t writeHexColor(std::uint32_t rgb, char16_t* out) {
    constexpr std::uint32_t lowDigits = 0x0F0F0F;
    const bool isShort = (rgb & lowDigits) == (rgb >> 4U & lowDigits);
    const int step = isShort ? 8 : 4;
    std::int32_t length = 0;
    out[length++] = u'#';
    for (int shift = 20; shift >= 0; shift -= step) {
        out[length++] = u"0123456789abcdef"[rgb >> shift & 0xFU];
    }
    return length;
}

/// Alpha as a share of 1: two decimals where they read back as the same alpha, else three.
double alphaShare(int alpha) {
    const double share = alpha / 255.0;
    const double hundredths = std::round(share * 100.0) / 100.0;
    const bool readsBack = std::lround(hundredths * 255.0) == alpha;
    return readsBack ? hundredths : std::round(share * 1000.0) / 1000.0;
}

std::size_t appendText(std::u16string_view part, char16_t* out) {
    return part.copy(out, part.size());
}

std::size_t appendBytes(const char* bytes, std::size_t length, char16_t* out) {
    for (std::size_t i = 0; i < length; ++i) {
        out[i] = static_cast<char16_t>(bytes[i]);
    }
    return length;
}

UnicodeString rgbaText(const MoxColor& color) {
    char16_t text[32]; // "rgba(255,255,255,0.502)" is as long as it gets
    char digits[maxRealText];
    std::size_t length = appendText(u"rgba(", text);
    for (const int component : {color.getRed(), color.getGreen(), color.getBlue()}) {
        length += appendBytes(digits, writeInteger(component, digits), text + length);
        text[length++] = u',';
    }
    const std::size_t count = writeReal(alphaShare(color.getAlpha()), digits);
    length += appendBytes(digits, count, text + length);
    text[length++] = u')';
    return {text, static_cast<std::int32_t>(length)};
}

} // namespace

UnicodeString MoxColor::toString(bool /*css*/, bool withAlpha, bool numbersOnly) const {
    if (getAlpha() == 0) {
        return {u"transparent", 11};
    }
    if (withAlpha && hasAlpha()) {
        return rgbaText(*this);
    }
    const std::uint32_t rgb = packed & rgbMask;
    char16_t text[longColorText];
    const std::int32_t length = writeHexColor(rgb, text);
    if (!numbersOnly) {
        const char16_t* word = findWord(htmlColorWords, rgb);
        if (word && std::u16string_view(word).size() < static_cast<std::size_t>(length)) {
            return UnicodeString(word);
        }
    }
    return {text, length};
}

} // namespace MoxCommonNS
