// The policy: which form an image takes, and images that stay where they are. Copying and embedding
// have sources of their own.
#include "images/SVGGraphicManager.h"

#include "DrawmereErrHandler.h"
#include "SVGConfig.h"
#include "foundation/common/MoxUri.h"
#include "foundation/graphicservice/GS_Graphic.h"
#include "frontend/DrawmereError.h"
#include "images/SVGImageElements.h"
#include "images/SVGImageStore.h"
#include "state/SVGGraphicContext.h"
#include "state/SVGGroupManager.h"
#include "tree/SVGTreeManager.h"

namespace DrawmereNS {

using namespace MoxGraphicService_NS;

namespace {

constexpr unsigned short queuedOffset = 512; // from the code of a text to that of its record
constexpr unsigned short loadError = 16417;
constexpr unsigned short rasterError = 16420;
constexpr unsigned short kindError = 16421;

enum class Rewriting { never, whenForced, always };

/// How images of one kind become JPEG and PNG, and whether they have to.
struct ConversionRule {
    GS_RasterKind kind;
    IMAGE_CONVERT_TYPE toJpeg;
    Rewriting asJpeg;
    IMAGE_CONVERT_TYPE toPng;
    Rewriting asPng;
};

constexpr auto always = Rewriting::always;
constexpr auto whenForced = Rewriting::whenForced;

constexpr ConversionRule conversionRules[] = {
    {RASTERKIND_PNG, CONVERT_PNG_JPEG, always, CONVERT_PNG_PNG, whenForced},
    // On purpose: a JPEG never becomes a PNG, not even by "png-all".
    {RASTERKIND_JPEG, CONVERT_JPEG_JPEG, whenForced, CONVERT_JPEG_JPEG, whenForced},
    {RASTERKIND_GIF, CONVERT_GIF_JPEG, always, CONVERT_GIF_PNG, always},
    {RASTERKIND_TIFF, CONVERT_TIFF_JPEG, always, CONVERT_TIFF_PNG, always},
    {RASTERKIND_BMP, CONVERT_BMP_JPEG, always, CONVERT_BMP_PNG, always},
    {RASTERKIND_WEBP, CONVERT_WEBP_JPEG, always, CONVERT_WEBP_PNG, always},
};

const ConversionRule* findRule(int kind) {
    for (const ConversionRule& rule : conversionRules) {
        if (rule.kind == kind) {
            return &rule;
        }
    }
    return nullptr;
}

MoxUri makeUri(const UnicodeString& text) {
    return {text, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr};
}

} // namespace

SVGGraphicManager::SVGGraphicManager() : errorHandler(DrawmereErrHandler::getDefault()) {}

SVGGraphicManager::~SVGGraphicManager() = default;

void SVGGraphicManager::init(SVGGroupManager* groups, SVGRefIDManager* refIds, SVGConfig* options,
                             const UnicodeString& newSourceBase, const UnicodeString& newTargetBase,
                             const MoxName& conversion, int newQuality, bool /*unusedFlag*/,
                             const UnicodeString& newUnusedText) {
    dropEncodedText();
    imageStore.reset();
    embeddedImages.clear();
    treeManager = groups ? groups->getTreeManager() : nullptr;
    groupManager = groups;
    config = options;
    refIdManager = refIds;
    sourceBase = newSourceBase;
    targetBase = newTargetBase;
    conversionName = conversion;
    quality = newQuality;
    unusedText = newUnusedText;
}

void SVGGraphicManager::report(unsigned short message, const UnicodeString& name) const {
    config->pushError(MoxError(static_cast<unsigned short>(message + queuedOffset),
                               DrawmereError::getErrorMessage(message, name), UnicodeString(),
                               /*lineNumber=*/-1, /*columnNumber=*/-1, UnicodeString()));
}

/// Queues what stands against the use of `graphic`.
bool SVGGraphicManager::isUsable(const GS_Graphic& graphic) const {
    if (!graphic.Loaded()) {
        report(loadError);
        return false;
    }
    if (!graphic.isRaster()) {
        report(rasterError);
        return false;
    }
    return true;
}

UnicodeString SVGGraphicManager::makeRefernceName(const UnicodeString& name) const {
    const MoxUri uri = makeUri(name);
    const UnicodeString base = uri.getBaseString();
    const bool isInPlace = base == sourceBase ? sourceBase == targetBase : base == targetBase;
    return isInPlace ? uri.getFileName() : name;
}

GS_GraphicType SVGGraphicManager::getCnvDstType(GS_RasterImage* raster) const {
    // On purpose: compares the keyword as it was set, so "jpeg" counts as "auto" here, although it
    // means the same to the configuration as "jpg".
    const MoxName conversion = config->imageConversionName;
    const int kind = raster->getRasterKind();
    if (conversion == MoxName(u"jpg-all")) {
        return GRAPHICTYPE_JPEG;
    }
    if (kind == RASTERKIND_PNG || kind == RASTERKIND_JPEG) {
        return kind == RASTERKIND_PNG ? GRAPHICTYPE_PNG : GRAPHICTYPE_JPEG;
    }
    if (raster->hasTransparency()) {
        return GRAPHICTYPE_PNG;
    }
    if (conversion == MoxName(u"jpg") || conversion == MoxName(u"png")) {
        return conversion == MoxName(u"jpg") ? GRAPHICTYPE_JPEG : GRAPHICTYPE_PNG;
    }
    return raster->getImageClass() == IMAGECLASS_PHOTOGRAPH ? GRAPHICTYPE_JPEG : GRAPHICTYPE_PNG;
}

bool SVGGraphicManager::isRequiredImageConvert(GS_RasterImage* raster, IMAGE_CONVERT_TYPE* type,
                                               bool force) const {
    const ConversionRule* const rule = findRule(raster->getRasterKind());
    if (!rule) {
        report(kindError);
        *type = CONVERT_BMP_JPEG;
        return false;
    }
    const bool toJpeg = getCnvDstType(raster) == GRAPHICTYPE_JPEG;
    *type = toJpeg ? rule->toJpeg : rule->toPng;
    return force || (toJpeg ? rule->asJpeg : rule->asPng) == Rewriting::always;
}

void SVGGraphicManager::referGraphic(const UnicodeString& href, MoxLength width, MoxLength height,
                                     MoxLength x, MoxLength y) {
    imageParent = treeManager->getCurrentNode();
    const MoxPtr<SVGElement> image = treeManager->document->createSVGElement(SVGName::image);
    image->setSVGAttribute(SVGName::preserveAspectRatio, imageAspect);
    setImageLength(*image, SVGName::x, x);
    setImageLength(*image, SVGName::y, y);
    setImageLength(*image, SVGName::width, width);
    setImageLength(*image, SVGName::height, height);
    groupManager->getGContext()->setOpacityAttribute(image.get(), OPACITYDEST_FILL,
                                                     /*isGroup=*/false, /*asOpacity=*/true);
    image->setAttribute(getHrefName(), MoxValue(href));
    groupManager->setElemMode(PAINTMODE_NONE, ELEMENTTYPE_IMAGE);
    groupManager->addElement(image.get());
}

} // namespace DrawmereNS
