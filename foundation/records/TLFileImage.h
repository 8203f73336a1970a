/// An image that is a file.
#pragma once

#include "foundation/records/TLGraphicImage.h"

#include <memory>

namespace TalGraphic {

/// An image in a local file. Drawn again, also by another record of the same path, it is the same
/// image: it is embedded or copied once.
class DRAWMERE_API TLFileImage : public TLGraphicImage {
public:
    /// Takes a local path or a `file:` URI, which is also the image's name. Nothing is opened yet.
    explicit TLFileImage(const UnicodeString& path);
    ~TLFileImage() override;

    /// Returns: the type that the content tells; `TLGRAPHICTYPE_OTHER` when it can't be read.
    TLGraphicType getGraphicType() override;

    /// Returns: the file, opened at the first call and until the record dies; null when it can't
    /// be opened. Owns: the image keeps the stream.
    std::istream* getStream() override;

private:
    std::unique_ptr<std::istream> file;
};

} // namespace TalGraphic
