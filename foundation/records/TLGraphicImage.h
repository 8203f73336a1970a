/// An image that the caller hands in.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"
#include "foundation/records/TLGraphicType.h"

#include <iosfwd>

namespace TalGraphic {

/// The base of all images: callers derive from it to say what an image is and where its bytes are.
class DRAWMERE_API TLGraphicImage {
public:
    TLGraphicImage(const TLGraphicImage&) = delete;
    TLGraphicImage& operator=(const TLGraphicImage&) = delete;

    /// Returns: the file type, any number.
    virtual TLGraphicType getGraphicType() = 0;

    /// Returns: a stream on the bytes of the file, which can be repositioned; null when there is
    /// none. Owns: the image keeps the stream.
    virtual std::istream* getStream() = 0;

    virtual ~TLGraphicImage();

    /// Returns: the original file name or URI, empty for an image that has no file.
    UnicodeString getOrgFileName() const;

protected:
    /// An image with this name, or without one.
    explicit TLGraphicImage(const UnicodeString& fileName = UnicodeString());

private:
    UnicodeString orgFileName;
};

} // namespace TalGraphic
