/// The element and attribute names of SVG 1.1.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxName.h"
#include "foundation/common/MoxNameTable.h"

#include <array>
#include <cstdint>

namespace TalCommon {

/// A name of SVG 1.1 by its number in the alphabetical list of all its element and attribute names.
/// It is distinct from `MoxName`, which numbers every name there is, and converts to it and back by
/// table, without a look at the text. A hyphen of the name is an underscore here (`clip_path`
/// beside `clipPath`), and a word that C++ keeps for itself ends in one (`class_`). Names with a
/// prefix ("xlink:href") have no number; they are plain `MoxName`s.
class DRAWMERE_API SVGName {
public:
    /// The numbers; 0 is no name of SVG. Callers may pass any number.
    enum Number : std::uint16_t {
        unknown,

#define SVG_NAME(identifier, text) identifier,
#include "foundation/names/SVGName.def"
#undef SVG_NAME
        count_ ///< one more than the last number
    };

    constexpr SVGName() = default;

    /// The name with this number; a number beyond the list is `unknown`.
    constexpr SVGName(Number listed) // NOLINT(google-explicit-constructor): names are its values
        : number(listed < count_ ? listed : unknown) {}

    /// The name with the text of `shared`, `unknown` when SVG 1.1 has no such name.
    constexpr explicit SVGName(MoxCommonNS::MoxName shared);

    /// The same name among all names; `unknown` is no name.
    constexpr operator MoxCommonNS::MoxName() const; // NOLINT(google-explicit-constructor)

    /// True when both are the same.
    constexpr bool operator==(const SVGName&) const = default;

    /// Returns: the number, `unknown` for no name.
    constexpr Number getNumber() const { return number; }

private:
    Number number = unknown;
};

/// A name of SVG 1.1 whose text is one of the well-known names, which have numbers of their own.
struct SVGNameWithFixedNumber {
    SVGName::Number number;          ///< in the list of SVG 1.1
    MoxCommonNS::MoxNameEnum shared; ///< among all names
};

/// All of them.
inline constexpr SVGNameWithFixedNumber svgNamesWithFixedNumber[] = {
    {SVGName::alphabetic, MoxCommonNS::MOXNAME_ALPHABETIC},
    {SVGName::id, MoxCommonNS::MOXNAME_ID},
    {SVGName::name, MoxCommonNS::MOXNAME_NAME},
    {SVGName::svg, MoxCommonNS::MOXNAME_SVG},
    {SVGName::target, MoxCommonNS::MOXNAME_TARGET},
};

/// For each number of a `SVGName` the number of its `MoxName`.
using SVGNameNumbers = std::array<std::uint32_t, SVGName::count_>;

/// Returns: the table that both conversions read. The table of shared names gives out the names of
/// SVG 1.1 first, in the order of the list, so a name's number follows from its place.
constexpr SVGNameNumbers makeSvgNameNumbers() {
    SVGNameNumbers numbers = {};
    for (std::uint32_t i = 1; i < numbers.size(); ++i) {
        numbers[i] = MoxCommonNS::MoxNameTable::firstFreeNumber + i - 1;
    }
    for (const SVGNameWithFixedNumber& fixed : svgNamesWithFixedNumber) {
        numbers[fixed.number] = fixed.shared;
    }
    return numbers;
}

inline constexpr SVGNameNumbers svgNameNumbers = makeSvgNameNumbers(); ///< made once

constexpr SVGName::SVGName(MoxCommonNS::MoxName shared) {
    // A number below the first free one wraps round to one that is far too large.
    const std::uint32_t place = shared.number - MoxCommonNS::MoxNameTable::firstFreeNumber + 1;
    if (place < count_ && svgNameNumbers[place] == shared.number) {
        number = static_cast<Number>(place);
        return;
    }
    for (const SVGNameWithFixedNumber& fixed : svgNamesWithFixedNumber) {
        if (fixed.shared == shared.number) {
            number = fixed.number;
        }
    }
}

constexpr SVGName::operator MoxCommonNS::MoxName() const {
    return MoxCommonNS::MoxName::fromNumber(svgNameNumbers[number]);
}

} // namespace TalCommon
