#include "foundation/graphicservice/GS_TiffReader.h"

#include "foundation/graphicservice/GS_Exif.h"
#include "foundation/graphicservice/GS_Graphic.h"

#include <algorithm>
#include <limits>
#include <tiffio.h>

namespace MoxGraphicService_NS {
namespace {

constexpr int rgbaChannels = 4;
constexpr std::uint32_t leastBand = 64; // rows

tmsize_t readBytes(thandle_t handle, void* target, tmsize_t count) {
    auto* input = static_cast<GS_Input*>(handle);
    const auto wanted = static_cast<std::size_t>(std::max<tmsize_t>(count, 0));
    return static_cast<tmsize_t>(input->read(target, wanted));
}

tmsize_t writeNothing(thandle_t /*handle*/, void* /*bytes*/, tmsize_t /*count*/) { return 0; }

toff_t seekTo(thandle_t handle, toff_t offset, int from) {
    auto* input = static_cast<GS_Input*>(handle);
    const std::uint64_t starts[] = {0, input->getPosition(), input->getSize()};
    const bool isKnown = from >= 0 && from < 3;
    const std::uint64_t target = isKnown ? starts[from] + offset : offset;
    return input->seek(target) ? target : std::numeric_limits<toff_t>::max();
}

int closeNothing(thandle_t /*handle*/) { return 0; }

toff_t getSize(thandle_t handle) { return static_cast<GS_Input*>(handle)->getSize(); }

int ignoreMessage(TIFF* /*tiff*/, void* /*data*/, const char* /*module*/, const char* /*format*/,
                  va_list /*arguments*/) {
    return 1; // libtiff then prints nothing
}

/// What libtiff may allocate at once: a page within the limit takes 8 bytes a pixel at most.
tmsize_t getMemoryLimit() {
    constexpr tmsize_t bytesPerPixel = 8;
    constexpr tmsize_t highest = std::numeric_limits<tmsize_t>::max() / bytesPerPixel;
    return std::min<tmsize_t>(GS_Graphic::getPixelLimit(), highest) * bytesPerPixel;
}

/// A file opened by libtiff, its first directory read.
class TiffFile {
public:
    explicit TiffFile(GS_Input& input) {
        TIFFOpenOptions* options = input.seek(0) ? TIFFOpenOptionsAlloc() : nullptr;
        if (options) {
            TIFFOpenOptionsSetMaxSingleMemAlloc(options, getMemoryLimit());
            TIFFOpenOptionsSetErrorHandlerExtR(options, ignoreMessage, nullptr);
            TIFFOpenOptionsSetWarningHandlerExtR(options, ignoreMessage, nullptr);
            tiff = TIFFClientOpenExt("", "rm", &input, readBytes, writeNothing, seekTo,
                                     closeNothing, getSize, nullptr, nullptr, options);
            TIFFOpenOptionsFree(options);
        }
    }

    TiffFile(const TiffFile&) = delete;
    TiffFile& operator=(const TiffFile&) = delete;

    ~TiffFile() {
        if (tiff) {
            TIFFClose(tiff);
        }
    }

    /// Returns: the value of a tag of two bytes, `fallback` when there is none.
    std::uint16_t get16(ttag_t tag, std::uint16_t fallback) const {
        std::uint16_t value = 0;
        return TIFFGetFieldDefaulted(tiff, tag, &value) == 1 ? value : fallback;
    }

    std::uint32_t get32(ttag_t tag) const {
        std::uint32_t value = 0;
        return TIFFGetField(tiff, tag, &value) == 1 ? value : 0;
    }

    float getReal(ttag_t tag) const {
        float value = 0.0F;
        return TIFFGetField(tiff, tag, &value) == 1 ? value : 0.0F;
    }

    /// Returns: whether inks are mixed; such a page may have an alpha that libtiff doesn't heed.
    bool isCmyk() const {
        return get16(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_RGB) == PHOTOMETRIC_SEPARATED;
    }

    /// Returns: the kind of the first sample behind the colours, EXTRASAMPLE_UNSPECIFIED without.
    std::uint16_t getExtraSample() const {
        std::uint16_t count = 0;
        std::uint16_t* kinds = nullptr; // borrowed
        const bool isStated = TIFFGetField(tiff, TIFFTAG_EXTRASAMPLES, &count, &kinds) == 1;
        return isStated && count > 0 ? kinds[0] : std::uint16_t{EXTRASAMPLE_UNSPECIFIED};
    }

    TIFF* tiff = nullptr; // owned; null when the header is none
};

constexpr double inchesPerUnit[] = {0.0, 0.0, 1.0, 1.0 / 2.54}; // none, none, inch, centimetre

void readResolution(const TiffFile& file, GS_ImageInfo& info) {
    const unsigned unit = file.get16(TIFFTAG_RESOLUTIONUNIT, RESUNIT_INCH);
    if (unit == RESUNIT_INCH || unit == RESUNIT_CENTIMETER) {
        info.setResolution(static_cast<double>(file.getReal(TIFFTAG_XRESOLUTION)),
                           static_cast<double>(file.getReal(TIFFTAG_YRESOLUTION)),
                           inchesPerUnit[unit]);
    }
}

/// On purpose: a further sample of no stated meaning is no alpha, as TIFF 6.0 has it; some programs
/// keep a mask in it that is not meant to be seen.
bool hasAlpha(const TiffFile& file) {
    const std::uint16_t kind = file.getExtraSample();
    if (file.isCmyk()) {
        return kind == EXTRASAMPLE_UNASSALPHA && TIFFIsTiled(file.tiff) == 0;
    }
    return kind == EXTRASAMPLE_ASSOCALPHA || kind == EXTRASAMPLE_UNASSALPHA;
}

bool isGrey(const TiffFile& file) {
    const std::uint16_t colors = file.get16(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_RGB);
    return colors == PHOTOMETRIC_MINISBLACK || colors == PHOTOMETRIC_MINISWHITE;
}

/// The pixels of a page, converted by libtiff some rows at a time.
class TiffRows {
public:
    TiffRows(const TiffFile& source, const GS_ImageInfo& facts) : file(source), info(facts) {
        isAssociated = file.getExtraSample() == EXTRASAMPLE_ASSOCALPHA;
        keepAlphaApart();
        char message[1024] = {};
        isOpen = TIFFRGBAImageBegin(&image, file.tiff, /*stop=*/1, message) == 1;
        if (isOpen) {
            image.req_orientation = image.orientation; // libtiff then turns nothing
        }
    }

    TiffRows(const TiffRows&) = delete;
    TiffRows& operator=(const TiffRows&) = delete;

    ~TiffRows() {
        if (isOpen) {
            TIFFRGBAImageEnd(&image);
        }
    }

    bool read(GS_Bitmap& bitmap) {
        if (!isOpen) {
            return false;
        }
        const int bandRows = getBandRows();
        const auto columns = static_cast<std::size_t>(info.columns);
        std::vector<std::uint32_t> band(columns * static_cast<unsigned>(bandRows));
        for (int y = 0; y < info.rows; y += bandRows) {
            const int count = std::min(bandRows, info.rows - y);
            image.row_offset = y;
            if (TIFFRGBAImageGet(&image, band.data(), image.width,
                                 static_cast<std::uint32_t>(count)) != 1) {
                return false;
            }
            takeBand(band, y, count, bitmap);
        }
        return true;
    }

private:
    /// libtiff multiplies colours by an alpha that is not multiplied in yet. That loses digits, so
    /// it is told that this was done.
    void keepAlphaApart() {
        std::uint16_t count = 0;
        std::uint16_t* kinds = nullptr; // borrowed
        if (TIFFGetField(file.tiff, TIFFTAG_EXTRASAMPLES, &count, &kinds) == 1 && count > 0 &&
            kinds[0] == EXTRASAMPLE_UNASSALPHA) {
            std::vector<std::uint16_t> changed(kinds, kinds + count);
            changed[0] = EXTRASAMPLE_ASSOCALPHA;
            TIFFSetField(file.tiff, TIFFTAG_EXTRASAMPLES, count, changed.data());
        }
    }

    /// Returns: how many rows are decoded together, so that no strip or tile is decoded twice.
    int getBandRows() const {
        const bool isTiled = TIFFIsTiled(file.tiff) != 0;
        const std::uint32_t rows =
            file.get32(isTiled ? ttag_t{TIFFTAG_TILELENGTH} : ttag_t{TIFFTAG_ROWSPERSTRIP});
        const auto all = static_cast<std::uint32_t>(info.rows);
        const std::uint32_t known = rows == 0 ? all : std::min(rows, all);
        return static_cast<int>((leastBand + known - 1) / known * known);
    }

    void takeBand(const std::vector<std::uint32_t>& band, int y, int count,
                  GS_Bitmap& bitmap) const {
        const auto columns = static_cast<std::size_t>(info.columns);
        for (int i = 0; i < count; ++i) {
            const std::uint32_t* from = band.data() + columns * static_cast<unsigned>(i);
            takeRow(from, bitmap.getRow(y + i), bitmap);
        }
    }

    void takeRow(const std::uint32_t* from, std::uint8_t* to, const GS_Bitmap& bitmap) const {
        for (int x = 0; x < bitmap.columns; ++x) {
            const std::uint32_t pixel = from[x];
            std::uint32_t colors[3] = {TIFFGetR(pixel), TIFFGetG(pixel), TIFFGetB(pixel)};
            const std::uint32_t alpha = TIFFGetA(pixel);
            if (bitmap.hasAlpha() && isAssociated) {
                divideByAlpha(colors, alpha);
            }
            const int colorCount = bitmap.channels < 3 ? 1 : 3;
            for (int i = 0; i < colorCount; ++i) {
                *to++ = static_cast<std::uint8_t>(colors[i]);
            }
            if (bitmap.hasAlpha()) {
                *to++ = static_cast<std::uint8_t>(alpha);
            }
        }
    }

    static void divideByAlpha(std::uint32_t (&colors)[3], std::uint32_t alpha) {
        constexpr std::uint32_t full = 255;
        for (std::uint32_t& color : colors) {
            color = alpha == 0 ? 0 : std::min(full, (color * full + alpha / 2) / alpha);
        }
    }

    const TiffFile& file;
    const GS_ImageInfo& info;
    TIFFRGBAImage image = {};
    bool isOpen = false;
    bool isAssociated = false; // colours are multiplied by alpha
};

/// Takes the fifth sample of each pixel as alpha. The file is opened anew, as libtiff can't go back
/// to the first row behind a reading by strips.
bool readCmykAlpha(GS_Input& input, GS_Bitmap& bitmap) {
    constexpr std::size_t inks = 4;
    const TiffFile file(input);
    if (!file.tiff) {
        return false;
    }
    const bool isApart =
        file.get16(TIFFTAG_PLANARCONFIG, PLANARCONFIG_CONTIG) != PLANARCONFIG_CONTIG;
    const std::size_t step = isApart ? 1 : file.get16(TIFFTAG_SAMPLESPERPIXEL, 1);
    const std::size_t first = isApart ? 0 : inks;
    const auto columns = static_cast<std::size_t>(bitmap.columns);
    std::vector<std::uint8_t> line(static_cast<std::size_t>(TIFFScanlineSize(file.tiff)));
    if (line.size() < (columns - 1) * step + first + 1) {
        return false;
    }
    for (int y = 0; y < bitmap.rows; ++y) {
        if (TIFFReadScanline(file.tiff, line.data(), static_cast<std::uint32_t>(y), inks) != 1) {
            return false;
        }
        std::uint8_t* row = bitmap.getRow(y);
        for (std::size_t x = 0; x < columns; ++x) {
            row[x * rgbaChannels + rgbaChannels - 1] = line[x * step + first];
        }
    }
    return true;
}

void takeProfile(const TiffFile& file, GS_Bitmap& bitmap) {
    std::uint32_t size = 0;
    void* profile = nullptr; // borrowed
    if (TIFFGetField(file.tiff, TIFFTAG_ICCPROFILE, &size, &profile) == 1) {
        bitmap.setProfile(static_cast<const std::uint8_t*>(profile), size);
    }
}

} // namespace

bool readTiffInfo(GS_Input& input, GS_ImageInfo& info) {
    const TiffFile file(input);
    char message[1024] = {};
    if (!file.tiff ||
        !info.setSize(file.get32(TIFFTAG_IMAGEWIDTH), file.get32(TIFFTAG_IMAGELENGTH)) ||
        TIFFRGBAImageOK(file.tiff, message) != 1) {
        return false;
    }
    info.orientation = checkOrientation(file.get16(TIFFTAG_ORIENTATION, ORIENTATION_TOPLEFT));
    info.mayBeTransparent = hasAlpha(file);
    readResolution(file, info);
    return true;
}

bool readTiffPixels(GS_Input& input, const GS_ImageInfo& info, GS_WantedSize /*wanted*/,
                    GS_Bitmap& bitmap) {
    const TiffFile file(input);
    if (!file.tiff) {
        return false;
    }
    const int colors = isGrey(file) ? 1 : rgbaChannels - 1;
    if (!bitmap.allocate(info.columns, info.rows, colors + (info.mayBeTransparent ? 1 : 0))) {
        return false;
    }
    takeProfile(file, bitmap);
    return TiffRows(file, info).read(bitmap) &&
           (!bitmap.hasAlpha() || !file.isCmyk() || readCmykAlpha(input, bitmap));
}

} // namespace MoxGraphicService_NS
