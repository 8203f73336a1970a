/// The raster image in a file.
#pragma once

#include "foundation/graphicservice/GS_Bitmap.h"
#include "foundation/graphicservice/GS_Format.h"
#include "foundation/graphicservice/GS_RasterImage.h"
#include "foundation/graphicservice/GS_WriteOptions.h"

namespace MoxGraphicService_NS {

class GS_Output;

/// Decodes a file when its pixels are wanted, and keeps them. A JPEG file that is only written
/// smaller is decoded at such a size.
class GS_FileImage : public GS_RasterImage {
public:
    /// Shape: `resolution`, in pixels an inch, when the file states none.
    /// Borrows: `source`, the file, for its own life.
    GS_FileImage(std::istream& source, const GS_Format& fileFormat, const GS_ImageInfo& facts,
                 float resolution);

    int getRasterKind() override;
    void writeToStream(std::ostream& target, IMAGE_CONVERT_TYPE type, int quality) override;
    void writeToFile(const char* path, IMAGE_CONVERT_TYPE type, int quality) override;
    int getImageClass() override;
    bool load() override;

protected:
    bool findTransparency() const override;

private:
    GS_WantedSize getWantedSize() const;
    bool decode(GS_WantedSize wanted) const;
    const GS_Bitmap* makeBitmap(GS_Bitmap& resampled, GS_Bitmap& turned) const;
    const GS_Bitmap* prepare(GS_Bitmap& resampled, GS_Bitmap& turned);
    bool write(const GS_Bitmap& bitmap, GS_Output& output, IMAGE_CONVERT_TYPE type, int quality);
    void fail(GS_Failure reason);

    std::istream& stream; // borrowed
    const GS_Format& format;
    GS_ImageInfo info;
    mutable GS_Bitmap pixels;      // as stored; none before they are wanted
    mutable bool isBroken = false; // they can't be decoded
};

} // namespace MoxGraphicService_NS
