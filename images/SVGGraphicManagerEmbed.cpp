// Images that become part of the document.
#include "images/SVGGraphicManager.h"

#include "SVGConfig.h"
#include "foundation/common/MoxMemStream.h"
#include "foundation/graphicservice/GS_Graphic.h"
#include "foundation/records/TLGraphicImage.h"
#include "frontend/DrawmereError.h"
#include "images/SVGBase64.h"
#include "images/SVGImageBytes.h"
#include "images/SVGImageElements.h"
#include "images/SVGImageStore.h"
#include "images/SVGImageText.h"
#include "refs/SVGRefIDManager.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tree/SVGTreeManager.h"
#include "tree/SVGUtil.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <utility>

namespace DrawmereNS {

using namespace MoxGraphicService_NS;
using MoxCommonNS::MoxKeptText;
using MoxCommonNS::MoxMemStream;

namespace {

constexpr float naturalResolution = 72.0F; // of files that state none
constexpr unsigned short encodingError = 16405;
constexpr unsigned short loadError = 16417;
constexpr unsigned long convertedSize = 8192; // where the stream of a converted image begins

constexpr std::string_view uriStart = "data:image/";
constexpr std::string_view uriEnd = "base64,\n";

/// The part of a data URI that tells its type; any other type has none.
constexpr std::string_view uriTypes[] = {"png;", "jpeg;"};

constexpr std::size_t prefixRoom = uriStart.size() + uriTypes[1].size() + uriEnd.size();

/// Tells of what the encoder of texts could not have; what it can't read is an empty text.
void requireMemory(int result) {
    if (result == SVGBase64::NO_MEMORY) {
        DrawmereError::throwError(encodingError);
    }
}

std::string makePrefix(GS_GraphicType type) {
    const bool isListed = type >= GRAPHICTYPE_PNG && type <= GRAPHICTYPE_JPEG;
    std::string prefix(uriStart);
    return prefix.append(isListed ? uriTypes[type] : "").append(uriEnd);
}

/// Halves away from zero, as an int; what an int can't tell is brought into its range, and no
/// number is 0.
int roundToInt(float number) {
    constexpr float limit = 2147483520.0F; // the largest float below the end of the range
    if (std::isnan(number)) {
        return 0;
    }
    const float moved = number < 0.0F ? number - 0.5F : number + 0.5F;
    return static_cast<int>(std::clamp(moved, -limit, limit));
}

/// A size in pixels.
struct PixelSize {
    int width;
    int height;

    bool operator==(const PixelSize&) const = default;
};

float real(int number) { return static_cast<float>(number); }

/// Returns: `side` in the proportion of `part` to `whole`.
int scaleSide(int side, int part, int whole) {
    return roundToInt(real(side) * real(part) / real(whole));
}

void limitLongerSide(PixelSize& size, int limit) {
    if (size.width > size.height) {
        if (size.width > limit) {
            size.height = std::max(1, scaleSide(size.height, limit, size.width));
            size.width = limit;
        }
    } else if (size.height > limit) {
        size.width = std::max(1, scaleSide(size.width, limit, size.height));
        size.height = limit;
    }
}

void fitInto(PixelSize& size, const PixelSize& source) {
    if (size.width > source.width) {
        size.height = scaleSide(size.height, source.width, size.width);
        size.width = source.width;
    }
    if (size.height > source.height) {
        size.width = scaleSide(size.width, source.height, size.height);
        size.height = source.height;
    }
}

struct SamplingChoice {
    std::int32_t option;
    GSMP_SAMPLINGTYPE type;
};

// On purpose: the options 2 and 3 are the other way round in the graphic service.
constexpr SamplingChoice samplingChoices[] = {
    {2, SAMPLINGTYPE_CUBIC},
    {3, SAMPLINGTYPE_LINEAR},
};

GSMP_SAMPLINGTYPE chooseSampling(std::int32_t option) {
    for (const SamplingChoice& choice : samplingChoices) {
        if (choice.option == option) {
            return choice.type;
        }
    }
    return SAMPLINGTYPE_AVERAGE;
}

/// Returns: 0, which states no resolution, for a length of no use.
int countPerInch(int pixels, float inches) {
    const float resolution = real(pixels) / inches;
    return std::isfinite(resolution) ? roundToInt(resolution) : 0;
}

} // namespace

void SVGGraphicManager::embedGraphic(TLGraphicImage* image, MoxLength width, MoxLength height,
                                     MoxLength x, MoxLength y) {
    std::istream* const stream = image->getStream();
    if (!stream) {
        report(loadError);
        return;
    }
    const GS_Graphic graphic(*stream, naturalResolution);
    if (!isUsable(graphic)) {
        return;
    }
    // A gradient is open, which takes no image. Storing one would move the cursor out of it, and
    // each later use of the image would lead nowhere.
    if (!treeManager->unlocked) {
        return;
    }
    imageParent = treeManager->getCurrentNode();
    const UnicodeString name = image->getOrgFileName();
    const auto known = name.isEmpty() ? embeddedImages.end() : embeddedImages.find(name);
    if (known != embeddedImages.end()) {
        useEmbededImage(known->second, width, height, x, y);
        return;
    }
    SVGStoredImage bytes;
    if (!keepGraphic(*stream, *graphic.raster, width, height, bytes)) {
        report(loadError);
        return;
    }
    const MoxPtr<MoxKeptText> uri(
        new SVGImageText(makePrefix(getCnvDstType(graphic.raster)), std::move(bytes)));
    const UnicodeString reference = storeImage(MoxValue::fromKept(uri));
    useEmbededImage(reference, width, height, x, y);
    if (!name.isEmpty()) {
        embeddedImages[name] = reference;
    }
}

/// Keeps the bytes of the file, or what they are converted into.
/// Returns: false when the pixels were needed and can't be read.
bool SVGGraphicManager::keepGraphic(std::istream& source, GS_RasterImage& raster, MoxLength width,
                                    MoxLength height, SVGStoredImage& bytes) {
    const bool isDownsampled = execDownsample(&raster, width, height);
    IMAGE_CONVERT_TYPE type = CONVERT_BMP_JPEG;
    if (!isRequiredImageConvert(&raster, &type, isDownsampled)) {
        keepBytes(source, bytes);
        return true;
    }
    MoxMemStream converted(nullptr, convertedSize, /*ownsSource=*/false);
    raster.writeToStream(converted, type, config->jpegQuality);
    if (raster.getFailure() != FAILURE_NONE) {
        return false;
    }
    keepBytes(converted, bytes);
    return true;
}

/// Keeps what a stream holds; one that can't be read holds nothing.
void SVGGraphicManager::keepBytes(std::istream& source, SVGStoredImage& bytes) {
    dropEncodedText(); // of an image that nobody has stored, and which this one replaces
    const std::streamoff length = std::max<std::streamoff>(0, SVGImageBytes::start(source));
    if (SVGBase64::CalculateRecquiredEncodeOutputBufferSize(length) < 1) {
        DrawmereError::throwError(encodingError);
    }
    if (!imageStore) {
        imageStore = std::make_unique<SVGImageStore>();
    }
    if (!imageStore->keep(source, static_cast<std::size_t>(length), bytes)) {
        DrawmereError::throwError(encodingError);
    }
}

bool SVGGraphicManager::execDownsample(GS_RasterImage* raster, MoxLength width,
                                       MoxLength height) const {
    if (config->downsampleDpi < 1) {
        return false;
    }
    const float scale = groupManager->getScale();
    const float widthInches = width.getRealValue(MoxCommonNS::MOXUNIT_INCH);
    const float heightInches = height.getRealValue(MoxCommonNS::MOXUNIT_INCH);
    const float dpi = real(config->downsampleDpi);
    const PixelSize source = {raster->Columns(), raster->Rows()};
    PixelSize size = {std::max(1, roundToInt(dpi * widthInches * scale)),
                      std::max(1, roundToInt(dpi * heightInches * scale))};
    if (config->downsampleThreshold > 0) {
        limitLongerSide(size, config->downsampleThreshold);
    }
    fitInto(size, source);
    if (size == source) {
        return false;
    }
    raster->gl_setDownsample(size.width, size.height, chooseSampling(config->downsampleType));
    raster->gl_setResolution(countPerInch(size.width, widthInches * scale),
                             countPerInch(size.height, heightInches * scale), RESOLUTIONUNIT_INCH);
    return true;
}

char* SVGGraphicManager::base64Encoding(const char* path) {
    makeEncodedBlock(SVGBase64::CreateMatchingEncodingBuffer(path, BASE64INPUTTYPE_FILE));
    requireMemory(SVGBase64::encodeFile2Buffer(path, encodedText, encodedSize));
    return encodedText;
}

char* SVGGraphicManager::base64Encoding(std::istream& source) {
    const std::streamoff length = std::max<std::streamoff>(0, SVGImageBytes::start(source));
    makeEncodedBlock(SVGBase64::CalculateRecquiredEncodeOutputBufferSize(length));
    requireMemory(SVGBase64::encodeStream2Buffer(source, encodedText, encodedSize));
    return encodedText;
}

/// Makes room for a text of `size` bytes, and for the prefix that it gets, so that it never moves.
void SVGGraphicManager::makeEncodedBlock(int size) {
    dropEncodedText();
    if (size < 1) {
        DrawmereError::throwError(encodingError);
    }
    encodedBlock = MoxCommonNS::makeZeroBlock(prefixRoom + size);
    if (!encodedBlock) {
        DrawmereError::throwError(encodingError);
    }
    encodedText = encodedBlock.get() + prefixRoom;
    encodedSize = size;
}

void SVGGraphicManager::dropEncodedText() {
    encodedText = nullptr;
    encodedSize = 0;
    encodedBlock.reset();
}

MoxValue SVGGraphicManager::takeDataUri(GS_GraphicType type) {
    const std::string prefix = makePrefix(type);
    if (!encodedText) {
        return MoxValue::fromAscii(prefix);
    }
    const std::size_t length = std::char_traits<char>::length(encodedText);
    const std::size_t begin = prefixRoom - prefix.size();
    prefix.copy(encodedBlock.get() + begin, prefix.size());
    MoxValue uri = MoxValue::adoptAscii(std::move(encodedBlock), begin, prefix.size() + length);
    dropEncodedText();
    return uri;
}

UnicodeString SVGGraphicManager::embedImage(MoxLength /*width*/, MoxLength /*height*/,
                                            GS_GraphicType type) {
    return storeImage(takeDataUri(type));
}

UnicodeString SVGGraphicManager::storeImage(MoxValue&& uri) {
    const UnicodeString id = refIdManager->createReferenceID(SVGRefIDManager::REFIMAGE);
    const MoxPtr<SVGElement> image = treeManager->document->createSVGElement(SVGName::image);
    image->setSVGAttribute(SVGName::id, MoxValue(id));
    image->setSVGAttribute(SVGName::width, u"100%");
    image->setSVGAttribute(SVGName::height, u"100%");
    image->setSVGAttribute(SVGName::preserveAspectRatio, imageAspect);
    image->setAttribute(getHrefName(), std::move(uri));
    treeManager->findDefs(treeManager->document->getDocumentElement());
    treeManager->addElement(image.get(), /*makeCurrent=*/false);
    return UnicodeString(u'#') + id;
}

void SVGGraphicManager::useEmbededImage(UnicodeString reference, MoxLength width, MoxLength height,
                                        MoxLength x, MoxLength y) {
    if (!imageParent) {
        return;
    }
    SVGDocument& document = *treeManager->document;
    const MoxPtr<SVGElement> use = document.createSVGElement(SVGName::use);
    const MoxPtr<SVGElement> group = document.createSVGElement(SVGName::g);
    const MoxPtr<SVGElement> box = document.createSVGElement(SVGName::svg);
    use->setAttribute(getHrefName(), MoxValue(reference));
    setImageLength(*box, SVGName::width, width);
    setImageLength(*box, SVGName::height, height);
    setImageLength(*box, SVGName::x, x);
    setImageLength(*box, SVGName::y, y);
    SVGGraphicContext& context = *groupManager->getGContext();
    context.setOpacityAttribute(use.get(), OPACITYDEST_FILL, /*isGroup=*/false, /*asOpacity=*/true);
    stampGroup(*group, context);
    // The node that was current when the call began: storing has moved the cursor into `defs`.
    imageParent->appendChild(group.get());
    group->appendChild(box.get());
    box->appendChild(use.get());
}

/// Gives the group of an image the transform and the clip path that stand where it goes.
void SVGGraphicManager::stampGroup(SVGElement& group, SVGGraphicContext& context) const {
    if (SVGUtil::getSVGLocalName(imageParent.get()) == SVGName::svg) {
        context.copyGroup2Root();
        context.setTransformAttr(&group, TRANSFORMMODE_ROOT);
        context.setClipPathAttrVal(&group, /*flag=*/true);
    } else {
        context.copyCur2Group(/*multiply=*/false);
        context.setTransformAttr(&group, TRANSFORMMODE_GROUP);
    }
}

} // namespace DrawmereNS
