#include "fonts/SVGEmbTLString.h"

namespace DrawmereNS {

SVGEmbTLString::SVGEmbTLString() = default;

SVGEmbTLString::SVGEmbTLString(std::u16string_view text)
    : UnicodeString(text.data(), static_cast<std::int32_t>(text.size())) {}

SVGEmbTLString::SVGEmbTLString(const SVGEmbTLString& other) = default;

SVGEmbTLString& SVGEmbTLString::operator=(const SVGEmbTLString& other) = default;

SVGEmbTLString::~SVGEmbTLString() = default;

bool SVGEmbTLString::operator<(const SVGEmbTLString& other) const {
    if (length() != other.length()) {
        return length() > other.length();
    }
    return viewOf(*this) > viewOf(other);
}

} // namespace DrawmereNS
