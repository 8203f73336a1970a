// Image files: whatever the bytes are, they are refused or become an image of the size asked for,
// in bounded memory.
#include "foundation/records/TLMemoryImage.h"
#include "tests/fuzz/Require.h"
#include "tests/support/Choices.h"
#include "tests/support/SvgPage.h"
#include "tests/support/TestImage.h"
#include "tests/support/XmlReader.h"

using namespace DrawmereTest;
using namespace DrawmereNS;
using namespace MoxGraphicService_NS;

namespace {

constexpr std::int64_t mostPixels = 1 << 20;
constexpr std::size_t choiceBytes = 8;

constexpr IMAGE_CONVERT_TYPE conversions[] = {CONVERT_PNG_PNG, CONVERT_PNG_JPEG};

struct Size {
    bool operator==(const Size&) const = default;

    int columns = 0;
    int rows = 0;
};

/// Returns: the size of an image that is whole, nothing for any other.
Size measure(const std::string& bytes) {
    std::istringstream source(bytes);
    const GS_Graphic graphic(source, 72.0F);
    const bool isWhole = graphic.raster && graphic.raster->load();
    return isWhole ? Size{graphic.raster->Columns(), graphic.raster->Rows()} : Size{};
}

void checkConversion(const std::string& bytes, Choices& choices) {
    std::istringstream source(bytes);
    const GS_Graphic graphic(source, 72.0F);
    require(graphic.isRaster() == (graphic.raster != nullptr), "a raster without one");
    if (!graphic.raster) {
        return;
    }
    GS_RasterImage& image = *graphic.raster;
    Size size = {image.Columns(), image.Rows()};
    require(size.columns > 0 && size.rows > 0 &&
                std::int64_t{size.columns} * size.rows <= mostPixels,
            "a size beyond the limit");
    if (choices.flag()) {
        image.hasTransparency();
        image.getImageClass();
    }
    if (choices.flag()) {
        const int columns = static_cast<int>(choices.below(200));
        const int rows = static_cast<int>(choices.below(200));
        image.gl_setDownsample(columns, rows, static_cast<GSMP_SAMPLINGTYPE>(choices.below(4)));
        size = {std::clamp(columns, 1, size.columns), std::clamp(rows, 1, size.rows)};
    }
    std::ostringstream target;
    image.writeToStream(target, choices.pick(conversions), static_cast<int>(choices.below(101)));
    const bool isWritten = image.getFailure() == FAILURE_NONE;
    require(isWritten == !target.str().empty(), "bytes of a failed image, or none of a good one");
    require(!isWritten || measure(target.str()) == size, "the written image has another size");
}

void checkEmbedding(const std::string& bytes, Choices& choices) {
    SvgPage page;
    page.config.downsampleDpi = static_cast<int>(choices.below(256));
    page.config.setImageConversion(MoxName(choices.flag() ? u"auto" : u"jpg-all"));
    TalGraphic::TLMemoryImage image(bytes, u"a.png");
    page->drawImage(&image, {}, pt(30), pt(20), pt(1), pt(2));
    const XmlReading reading = readXml(page.document());
    require(reading.error.empty(), reading.error);
    const std::string data = reading.element("image").attribute("xlink:href");
    const bool isStored = data.starts_with("data:image/");
    const bool isKnown = measure(bytes) != Size();
    require(isStored || page.config.hasError(), "an image is lost without a word");
    require(isStored || !isKnown, "a good image is not stored");
}

} // namespace

/// The file, and behind it what is done with it.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    GS_Graphic::setPixelLimit(mostPixels);
    const std::string bytes(inputOf(data, size));
    const std::string tail = bytes.substr(bytes.size() - std::min(bytes.size(), choiceBytes));
    Choices choices(tail);
    if (choices.below(8) == 7) {
        checkEmbedding(bytes, choices);
    } else {
        checkConversion(bytes, choices);
    }
    return 0;
}
