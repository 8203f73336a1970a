/// A colour with an opacity.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"

#include <cstdint>
#include <type_traits>

namespace MoxCommonNS {

/// Red, green, blue and alpha, eight bits each, in one packed number that is passed by value. Alpha
/// 255 is opaque and counts as no alpha part.
class DRAWMERE_API MoxColor {
public:
    /// Opaque black.
    constexpr MoxColor() = default;

    /// An opaque colour; components are clamped to 0..255.
    constexpr MoxColor(int red, int green, int blue) : MoxColor(red, green, blue, opaque) {}

    /// Components and alpha are clamped to 0..255.
    constexpr MoxColor(int red, int green, int blue, int alpha)
        : packed((opaque - clamp(alpha)) << 24U | clamp(red) << 16U | clamp(green) << 8U |
                 clamp(blue)) {}

    /// The packed form 0xTTRRGGBB, where TT is 255 less alpha: 0xFF0000 is opaque red.
    constexpr MoxColor(unsigned int rgb) // NOLINT(google-explicit-constructor): a way to write one
        : packed(rgb) {}

    /// Returns: 0 to 255.
    constexpr int getRed() const { return component(16); }

    /// Returns: 0 to 255.
    constexpr int getGreen() const { return component(8); }

    /// Returns: 0 to 255.
    constexpr int getBlue() const { return component(0); }

    /// Returns: 0, transparent, to 255, opaque.
    constexpr int getAlpha() const { return static_cast<int>(opaque) - component(24); }

    /// Returns: the packed form 0xTTRRGGBB.
    constexpr std::uint32_t getPacked() const { return packed; }

    /// Returns: true unless the colour is opaque.
    constexpr bool hasAlpha() const { return getAlpha() != static_cast<int>(opaque); }

    /// Makes the colour opaque.
    constexpr void clearAlpha() { packed &= rgbMask; }

    /// The text of the colour in a document: "#rgb" where that says the same as "#rrggbb", or one
    /// of the sixteen colour names of HTML 4 where that is strictly shorter ("red", but "#000"). A
    /// fully transparent colour is "transparent" in every case. Shape: `css` asks for CSS syntax,
    /// the only one there is; `withAlpha` for "rgba(r,g,b,a)" when the colour has an alpha part,
    /// which is left out otherwise; `numbersOnly` for no names.
    UnicodeString toString(bool css, bool withAlpha, bool numbersOnly) const;

    /// True when both are the same.
    constexpr bool operator==(const MoxColor&) const = default;

    std::uint32_t packed = 0; ///< 0xTTRRGGBB

private:
    static constexpr std::uint32_t opaque = 255;
    static constexpr std::uint32_t rgbMask = 0xFFFFFF;

    static constexpr std::uint32_t clamp(int value) {
        return value < 0 ? 0U : value > 255 ? 255U : static_cast<std::uint32_t>(value);
    }

    constexpr int component(unsigned int shift) const {
        return static_cast<int>(packed >> shift & 0xFFU);
    }
};

static_assert(sizeof(MoxColor) == 4 && std::is_trivially_copyable_v<MoxColor>);

} // namespace MoxCommonNS
