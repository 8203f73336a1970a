#include "tools/convert/ImageWriter.h"

#include "foundation/graphicservice/GS_Graphic.h"
#include "foundation/records/TLMemoryImage.h"
#include "tools/convert/ImagePixels.h"

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <utility>

namespace DrawmereConvert {
namespace {

using namespace MoxGraphicService_NS; // NOLINT(google-build-using-namespace): many short names
using TalGraphic::TLMemoryImage;

constexpr float resolution = 72; // of images that state none

constexpr float pixelsPerPoint = 96.0F / 72.0F;
constexpr int maxZoom = 8;
constexpr int maxZoomedPixels = 2'000'000;
constexpr MoxColor opaque{};

/// Documents mean the pixels of a coarse image to be seen, where SVG viewers smooth them; larger
/// squares in their place keep their edges. An image and its mask, if any, have the size of the
/// larger.
int findZoom(const fz_image& image, const fz_image* mask, const fz_matrix& matrix) {
    const int width = mask ? std::max(image.w, mask->w) : image.w;
    const int height = mask ? std::max(image.h, mask->h) : image.h;
    const float across = std::hypot(matrix.a, matrix.b) * pixelsPerPoint;
    const float down = std::hypot(matrix.c, matrix.d) * pixelsPerPoint;
    const float size =
        std::max(across / static_cast<float>(width), down / static_cast<float>(height));
    if (image.interpolate || !(size > 2)) {
        return 1;
    }
    const double room = static_cast<double>(maxZoomedPixels) / width / height;
    const double zoom = std::min(
        {std::ceil(static_cast<double>(size)), std::sqrt(room), static_cast<double>(maxZoom)});
    return std::max(1, static_cast<int>(zoom));
}

bool isWantedAsJpeg(const MoxName& conversion, GS_RasterImage& image) {
    if (conversion == MoxName(u"png") || conversion == MoxName(u"png-all")) {
        return false;
    }
    return conversion == MoxName(u"jpg") || conversion == MoxName(u"jpg-all") ||
           image.getImageClass() == IMAGECLASS_PHOTOGRAPH;
}

UnicodeString getExtension(const std::string& bytes) {
    return bytes.starts_with("\xFF\xD8") ? u".jpg" : bytes.starts_with("BM") ? u".bmp" : u".png";
}

} // namespace

ImageWriter::~ImageWriter() {
    for (const auto& file : files) {
        fz_drop_image(ctx, file.first.image);
        fz_drop_image(ctx, file.first.mask);
    }
}

void ImageWriter::draw(fz_image* image, fz_image* mask, const fz_matrix& matrix, float alpha,
                       COLORUSE use) {
    place(findFile({image, mask, use, 0, findZoom(*image, mask, matrix)}), matrix, alpha);
}

bool ImageWriter::isPhotograph(fz_image* image) const {
    constexpr std::size_t worthAMask = 16384;
    const std::string stored = findStoredImage(ctx, image);
    return stored.size() > worthAMask && stored.starts_with("\xFF\xD8");
}

void ImageWriter::drawStencil(fz_image* image, const fz_matrix& matrix, const MoxColor& color) {
    const float alpha = static_cast<float>(color.getAlpha()) / 255.0F;
    MoxColor solid = color;
    solid.clearAlpha();
    place(findFile({image, nullptr, COLORUSE_PICTURE, solid.getPacked(),
                    findZoom(*image, nullptr, matrix)}),
          matrix, alpha);
}

void ImageWriter::drawPixels(const ImagePixels& pixels, const fz_matrix& matrix, float alpha,
                             COLORUSE use) {
    ImageLook look;
    look.isWhite = use == COLORUSE_ALPHA;
    look.isGray = use == COLORUSE_LUMINOSITY;
    ImageFile file{packBitmap(encodeImage(pixels, look)), {}};
    file.name = makeName(file.bytes);
    place(file, matrix, alpha);
}

const ImageWriter::ImageFile& ImageWriter::findFile(const ImageKey& key) {
    const auto [entry, isNew] = files.try_emplace(key);
    if (isNew) {
        fz_keep_image(ctx, key.image);
        fz_keep_image(ctx, key.mask);
        entry->second.bytes = packBitmap(makeBytes(key));
        entry->second.isLinked = isLinkedFile(entry->second.bytes);
        entry->second.name = entry->second.isLinked ? UnicodeString::fromUTF8(options.linkReference)
                                                    : makeName(entry->second.bytes);
    }
    return entry->second;
}

bool ImageWriter::isLinkedFile(const std::string& bytes) const {
    std::error_code isMissing;
    if (options.linkFile.empty() || bytes.empty() ||
        std::filesystem::file_size(options.linkFile, isMissing) != bytes.size()) {
        return false;
    }
    std::ifstream file(options.linkFile, std::ios::binary);
    return std::equal(bytes.begin(), bytes.end(), std::istreambuf_iterator<char>(file),
                      std::istreambuf_iterator<char>());
}

std::string ImageWriter::makeBytes(const ImageKey& key) {
    const bool isAsItIs = !key.mask && key.use == COLORUSE_PICTURE && !key.image->imagemask;
    std::string stored = isAsItIs ? findStoredImage(ctx, key.image) : std::string();
    // Only a photograph looks no better for sharp edges.
    const bool isKept = key.zoom == 1 || stored.starts_with("\xFF\xD8") || isLinkedFile(stored);
    return stored.empty() || !isKept ? decode(key) : stored;
}

std::string ImageWriter::decode(const ImageKey& key) {
    const ImagePixels pixels(ctx, key.image);
    ImageLook look;
    look.zoom = key.zoom;
    look.isWhite = key.use == COLORUSE_ALPHA;
    look.isGray = key.use == COLORUSE_LUMINOSITY;
    if (key.image->imagemask) {
        look.color = key.color;
    }
    if (!key.mask) {
        return encodeImage(pixels, look);
    }
    const ImagePixels mask(ctx, key.mask);
    if (mask.isEmpty()) {
        report.note(APPROXIMATION_MASK);
    } else {
        look.mask = &mask;
    }
    return encodeImage(pixels, look);
}

// How large the file of a bitmap becomes decides where it goes, so that of a large one is made
// here, in the form that the library would choose.
std::string ImageWriter::packBitmap(std::string bytes) {
    const SVGConfig& config = *canvas.out.config;
    if (!bytes.starts_with("BM")) {
        return bytes;
    }
    report.note(APPROXIMATION_IMAGE);
    if (bytes.size() <= options.maxInlineBytes || config.downsampleDpi > 0) {
        return bytes;
    }
    std::istringstream source(bytes);
    std::ostringstream target;
    const GS_Graphic bitmap(source, resolution);
    if (!bitmap.raster) {
        return bytes;
    }
    const bool isJpeg = isWantedAsJpeg(config.imageConversionName, *bitmap.raster);
    bitmap.raster->writeToStream(target, isJpeg ? CONVERT_BMP_JPEG : CONVERT_BMP_PNG,
                                 config.jpegQuality);
    return bitmap.raster->getFailure() == FAILURE_NONE ? std::move(target).str() : bytes;
}

// The same bytes have the same name everywhere, so that files beside the pages are written once.
UnicodeString ImageWriter::makeName(const std::string& bytes) {
    constexpr const char* digits = "0123456789abcdef";
    constexpr int shownBytes = 6;
    unsigned char digest[16];
    fz_md5 state;
    fz_md5_init(&state);
    fz_md5_update(&state, reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size());
    fz_md5_final(&state, digest);
    UnicodeString name(u"image-");
    for (int i = 0; i < shownBytes; ++i) {
        name.append(static_cast<char16_t>(digits[digest[i] >> 4U]));
        name.append(static_cast<char16_t>(digits[digest[i] & 15U]));
    }
    return name + getExtension(bytes);
}

void ImageWriter::place(const ImageFile& file, const fz_matrix& matrix, float alpha) {
    const float width = std::hypot(matrix.a, matrix.b);
    const float height = std::hypot(matrix.c, matrix.d);
    if (file.bytes.empty()) {
        report.isComplete = false;
        return;
    }
    if (!(width > 0) || !(height > 0)) {
        return;
    }
    canvas.flush();
    // The opacity of an image counts against what the open group had, which must be none.
    canvas.settings.setFill({opaque});
    canvas.push();
    const bool isUpright = matrix.b == 0 && matrix.c == 0 && matrix.a > 0 && matrix.d > 0;
    if (isUpright && !(alpha < 1)) {
        drawUnit(file, width, height, matrix.e, matrix.f);
    } else {
        canvas.transform(fz_pre_scale(matrix, 1 / width, 1 / height));
        canvas.push(); // which moves the matrix from the image to what contains it
        canvas.settings.setFill({MoxColor(0, 0, 0, static_cast<int>(std::lround(alpha * 255)))});
        drawUnit(file, width, height, 0, 0);
        canvas.pop();
    }
    canvas.pop();
}

void ImageWriter::drawUnit(const ImageFile& file, float width, float height, float x, float y) {
    TLMemoryImage image(file.bytes, file.name);
    SVGConfig& config = *canvas.out.config;
    const MoxName chosen = config.imageProcessingName;
    const bool isTooLarge =
        file.bytes.size() > options.maxInlineBytes && !file.bytes.starts_with("BM");
    const bool isLarge = isTooLarge && !config.streamOutput;
    if (isTooLarge && !file.isLinked && config.streamOutput) {
        report.note(APPROXIMATION_LIMIT); // there is no place for a file
    }
    if (file.isLinked || isLarge) {
        config.setImageProcessingType(MoxName(file.isLinked ? u"link" : u"copy"));
    }
    canvas.beginElement();
    canvas.out.drawImage(&image, image.getGraphicType(), pt(width), pt(height), pt(x), pt(y));
    canvas.endElement();
    if (file.isLinked || isLarge) {
        config.setImageProcessingType(chosen);
    }
}

} // namespace DrawmereConvert
