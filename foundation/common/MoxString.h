/// Brings ICU's string class, the text type of the whole system, into the system's namespaces.
#pragma once

#include <cstddef>
#include <string_view>
#include <unicode/unistr.h>

namespace MoxCommonNS {
using icu::UnicodeString;

/// Returns: the code units of `text`, borrowed; comparing them with a literal makes no string.
inline std::u16string_view viewOf(const UnicodeString& text) {
    return {text.getBuffer(), static_cast<std::size_t>(text.length())};
}

} // namespace MoxCommonNS

namespace DrawmereNS {
using icu::UnicodeString;
using MoxCommonNS::viewOf;
} // namespace DrawmereNS

namespace TalCommon {
using icu::UnicodeString;
}

namespace TalGraphic {
using icu::UnicodeString;
}

namespace TalFont {
using icu::UnicodeString;
}

namespace MoxFontService_NS {
using icu::UnicodeString;
}
