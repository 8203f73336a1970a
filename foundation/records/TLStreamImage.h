/// An image that comes from a stream.
#pragma once

#include "foundation/records/TLGraphicImage.h"

namespace TalGraphic {

/// An image in a stream of the caller's. With a name it is found again when it is drawn a second
/// time, also by another record: it is embedded or copied once. Without one each drawing stores it
/// anew.
class DRAWMERE_API TLStreamImage : public TLGraphicImage {
public:
    /// Borrows: `source`, for as long as the record lives. It is read from its beginning, so it
    /// must be one that can be repositioned; a null is an image that can't be loaded.
    explicit TLStreamImage(std::istream* source, const UnicodeString& name = UnicodeString());
    ~TLStreamImage() override;

    /// Returns: the type that the bytes tell; `TLGRAPHICTYPE_OTHER` without a stream.
    TLGraphicType getGraphicType() override;

    /// Returns: the caller's stream.
    std::istream* getStream() override;

private:
    std::istream* stream; // borrowed
};

} // namespace TalGraphic
