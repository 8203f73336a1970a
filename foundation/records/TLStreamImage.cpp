#include "foundation/records/TLStreamImage.h"

namespace TalGraphic {

TLStreamImage::TLStreamImage(std::istream* source, const UnicodeString& name)
    : TLGraphicImage(name), stream(source) {}

TLStreamImage::~TLStreamImage() = default;

TLGraphicType TLStreamImage::getGraphicType() {
    return stream ? findGraphicType(*stream) : TLGRAPHICTYPE_OTHER;
}

std::istream* TLStreamImage::getStream() { return stream; }

} // namespace TalGraphic
