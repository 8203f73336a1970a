/// An interned name: a text that is compared by number.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxNameEnum.h"
#include "foundation/common/MoxString.h"

namespace MoxCommonNS {

/// A 32-bit name. Equal names have equal numbers; 0 is no name.
class DRAWMERE_API MoxName {
public:
    constexpr MoxName() = default;

    /// A name with a fixed number.
    constexpr MoxName(MoxNameEnum name) // NOLINT(google-explicit-constructor): names are its values
        : number(name) {}

    /// Interns `text`; the same text gives the same number in all threads. An empty text is no
    /// name.
    explicit MoxName(const UnicodeString& text);

    /// The name with this number, whether or not a text belongs to it.
    static constexpr MoxName fromNumber(std::uint32_t number) {
        return MoxName(static_cast<MoxNameEnum>(number));
    }

    /// True when both are the same.
    constexpr bool operator==(const MoxName&) const = default;

    /// Returns: whether it is a name; 0 is none.
    constexpr explicit operator bool() const { return number != 0; }

    std::uint32_t number = 0; ///< of the text in the shared table
};

} // namespace MoxCommonNS
