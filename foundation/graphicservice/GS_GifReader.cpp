#include "foundation/graphicservice/GS_GifReader.h"

#include <algorithm>
#include <gif_lib.h>

namespace MoxGraphicService_NS {
namespace {

int readBytes(GifFileType* gif, GifByteType* target, int count) {
    auto* input = static_cast<GS_Input*>(gif->UserData);
    return static_cast<int>(input->read(target, static_cast<std::size_t>(std::max(count, 0))));
}

/// A file opened by giflib and read up to its first picture.
class GifFile {
public:
    explicit GifFile(GS_Input& input) {
        int error = 0;
        gif = input.seek(0) ? DGifOpen(&input, readBytes, &error) : nullptr;
    }

    GifFile(const GifFile&) = delete;
    GifFile& operator=(const GifFile&) = delete;

    ~GifFile() {
        if (gif) {
            DGifCloseFile(gif, nullptr);
        }
    }

    /// Goes on to the data of the first picture. Returns: false when there is none.
    bool findPicture() {
        GifRecordType type = UNDEFINED_RECORD_TYPE;
        while (gif && DGifGetRecordType(gif, &type) == GIF_OK) {
            if (type == IMAGE_DESC_RECORD_TYPE) {
                return DGifGetImageDesc(gif) == GIF_OK && getColors();
            }
            if (type != EXTENSION_RECORD_TYPE || !readExtension()) {
                return false;
            }
        }
        return false;
    }

    /// Goes over the data of the picture. Returns: false when they are cut off.
    bool skipPicture() {
        int codeSize = 0;
        GifByteType* block = nullptr;
        int result = DGifGetCode(gif, &codeSize, &block);
        while (result == GIF_OK && block) {
            result = DGifGetCodeNext(gif, &block);
        }
        return result == GIF_OK;
    }

    const ColorMapObject* getColors() const {
        return gif->Image.ColorMap ? gif->Image.ColorMap : gif->SColorMap;
    }

    GifFileType* gif;                            // owned; null when the header is none
    int transparentIndex = NO_TRANSPARENT_COLOR; // of the picture

private:
    bool readExtension() {
        int code = 0;
        GifByteType* block = nullptr; // its length, then its bytes
        if (DGifGetExtension(gif, &code, &block) != GIF_OK) {
            return false;
        }
        GraphicsControlBlock control;
        if (code == GRAPHICS_EXT_FUNC_CODE && block &&
            DGifExtensionToGCB(block[0], block + 1, &control) == GIF_OK) {
            transparentIndex = control.TransparentColor;
        }
        while (block) {
            if (DGifGetExtensionNext(gif, &block) != GIF_OK) {
                return false;
            }
        }
        return true;
    }
};

/// Returns: whether the picture leaves a part of the screen as it is.
bool leavesBorder(const GifImageDesc& picture, const GS_ImageInfo& info) {
    return picture.Left > 0 || picture.Top > 0 || picture.Left + picture.Width < info.columns ||
           picture.Top + picture.Height < info.rows;
}

bool setSize(const GifFileType& gif, GS_ImageInfo& info) {
    const bool hasScreen = gif.SWidth > 0 && gif.SHeight > 0;
    const int columns = hasScreen ? gif.SWidth : gif.Image.Left + gif.Image.Width;
    const int rows = hasScreen ? gif.SHeight : gif.Image.Top + gif.Image.Height;
    // The picture too, as a line of it is decoded whole.
    GS_ImageInfo picture;
    return picture.setSize(static_cast<std::uint64_t>(gif.Image.Width),
                           static_cast<std::uint64_t>(gif.Image.Height)) &&
           info.setSize(static_cast<std::uint64_t>(columns), static_cast<std::uint64_t>(rows));
}

/// Writes a line of indices into its place in the bitmap, as far as it lies on the screen.
void placeLine(const GifFile& file, const std::vector<GifByteType>& line, int y,
               GS_Bitmap& bitmap) {
    const GifImageDesc& picture = file.gif->Image;
    const ColorMapObject& colors = *file.getColors();
    if (y + picture.Top >= bitmap.rows) {
        return;
    }
    std::uint8_t* row = bitmap.getRow(y + picture.Top);
    const int count = std::min(picture.Width, bitmap.columns - picture.Left);
    for (int x = 0; x < count; ++x) {
        const int index = line[static_cast<std::size_t>(x)];
        if (index == file.transparentIndex) {
            continue;
        }
        const bool isListed = index < colors.ColorCount;
        const GifColorType color = isListed ? colors.Colors[index] : GifColorType{0, 0, 0};
        std::uint8_t* pixel = row + std::ptrdiff_t{x + picture.Left} * bitmap.channels;
        pixel[0] = color.Red;
        pixel[1] = color.Green;
        pixel[2] = color.Blue;
        if (bitmap.hasAlpha()) {
            pixel[3] = UINT8_MAX;
        }
    }
}

/// Rows of an interlaced picture come in four passes.
struct Pass {
    int first;
    int step;
};

constexpr Pass plainPasses[] = {{0, 1}};
constexpr Pass interlacedPasses[] = {{0, 8}, {4, 8}, {2, 4}, {1, 2}};

bool readPass(GifFile& file, Pass pass, std::vector<GifByteType>& line, GS_Bitmap& bitmap) {
    const int height = file.gif->Image.Height;
    for (int y = pass.first; y < height; y += pass.step) {
        if (DGifGetLine(file.gif, line.data(), static_cast<int>(line.size())) != GIF_OK) {
            return false;
        }
        placeLine(file, line, y, bitmap);
    }
    return true;
}

} // namespace

bool readGifInfo(GS_Input& input, GS_ImageInfo& info) {
    GifFile file(input);
    if (!file.findPicture() || !setSize(*file.gif, info)) {
        return false;
    }
    info.mayBeTransparent =
        file.transparentIndex != NO_TRANSPARENT_COLOR || leavesBorder(file.gif->Image, info);
    return file.skipPicture();
}

bool readGifPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize /*wanted*/,
                   GS_Bitmap& bitmap) {
    GifFile file(input);
    if (!file.findPicture() ||
        !bitmap.allocate(info.columns, info.rows, info.mayBeTransparent ? 4 : 3)) {
        return false;
    }
    std::vector<GifByteType> line(static_cast<std::size_t>(file.gif->Image.Width));
    const auto readOne = [&](Pass pass) { return readPass(file, pass, line, bitmap); };
    return file.gif->Image.Interlace ? std::ranges::all_of(interlacedPasses, readOne)
                                     : std::ranges::all_of(plainPasses, readOne);
}

} // namespace MoxGraphicService_NS
