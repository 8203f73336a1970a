/// An image whose bytes are in memory.
#pragma once

#include "foundation/records/TLGraphicImage.h"

#include <memory>
#include <string_view>

namespace TalGraphic {

/// An image made of bytes that the caller holds. With a name it is found again when it is drawn a
/// second time, also by another record: it is embedded or copied once. Without one each drawing
/// stores it anew.
class DRAWMERE_API TLMemoryImage : public TLGraphicImage {
public:
    /// Borrows: `bytes`, for as long as the record lives.
    explicit TLMemoryImage(std::string_view bytes, const UnicodeString& name = UnicodeString());
    ~TLMemoryImage() override;

    /// Returns: the type that the bytes tell.
    TLGraphicType getGraphicType() override;

    /// Returns: a stream on the bytes. Owns: the image keeps the stream.
    std::istream* getStream() override;

private:
    class Stream;

    std::unique_ptr<Stream> stream;
};

} // namespace TalGraphic
