#include "SVGPageUri.h"

namespace DrawmereNS {

SVGPageUri::SVGPageUri(const UnicodeString& uri, const UnicodeString& format)
    : MoxUri(uri, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr), numberFormat(format) {}

} // namespace DrawmereNS
