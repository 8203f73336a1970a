/// The data URI of an embedded image, of which only the bytes are kept.
#pragma once

#include "foundation/common/MoxKeptText.h"
#include "images/SVGImageStore.h"

#include <string>

namespace DrawmereNS {

/// A prefix and the base64 text of an image, which is encoded whenever it is written.
class SVGImageText : public MoxCommonNS::MoxKeptText {
public:
    /// Owns: `bytes`. Shape: `prefix`, ASCII without markup.
    SVGImageText(std::string prefix, SVGStoredImage bytes);
    ~SVGImageText() override;

    std::size_t getLength() const override;
    /// Returns: false when the file with the bytes can't be read.
    bool handOut(std::string_view lineFeed, const Taker& take) const override;

private:
    std::string prefix;
    SVGStoredImage image;
};

} // namespace DrawmereNS
