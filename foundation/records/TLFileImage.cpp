#include "foundation/records/TLFileImage.h"

#include "foundation/common/MoxUri.h"

#include <istream>

namespace TalGraphic {

using MoxCommonNS::MoxUri;

TLFileImage::TLFileImage(const UnicodeString& path) : TLGraphicImage(path) {}

TLFileImage::~TLFileImage() = default;

TLGraphicType TLFileImage::getGraphicType() {
    std::istream* const stream = getStream();
    return stream ? findGraphicType(*stream) : TLGRAPHICTYPE_OTHER;
}

std::istream* TLFileImage::getStream() {
    if (!file) {
        const MoxUri uri(getOrgFileName(), MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr);
        file.reset(uri.getIStream(nullptr, nullptr));
    }
    return file.get();
}

} // namespace TalGraphic
