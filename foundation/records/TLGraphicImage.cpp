#include "foundation/records/TLGraphicImage.h"

namespace TalGraphic {

TLGraphicImage::~TLGraphicImage() = default;

UnicodeString TLGraphicImage::getOrgFileName() const { return orgFileName; }

TLGraphicImage::TLGraphicImage(const UnicodeString& fileName) : orgFileName(fileName) {}

} // namespace TalGraphic
