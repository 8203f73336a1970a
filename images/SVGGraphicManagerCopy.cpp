// Images that are copied or converted into files next to the output.
#include "images/SVGGraphicManager.h"

#include "SVGConfig.h"
#include "foundation/common/MoxCStr.h"
#include "foundation/common/MoxUri.h"
#include "foundation/common/MoxUtil.h"
#include "foundation/common/MoxWord.h"
#include "foundation/graphicservice/GS_Graphic.h"
#include "foundation/records/TLGraphicImage.h"
#include "images/SVGImageBytes.h"

#include <memory>
#include <new>
#include <optional>
#include <ostream>

namespace DrawmereNS {

using namespace MoxGraphicService_NS;
using MoxCommonNS::MoxCStr;
using MoxCommonNS::MoxUtil;
using MoxCommonNS::MoxWord;
using TalGraphic::TLGraphicType;

namespace {

constexpr float naturalResolution = 72.0F; // of files that state none
constexpr unsigned short loadError = 16417;
constexpr unsigned short copyError = 16419;

/// The types of files that a document can refer to, which are copied as they are.
constexpr MoxWord<TLGraphicType> extensions[] = {
    {TalGraphic::TLGRAPHICTYPE_JPEG, u".jpg"},
    {TalGraphic::TLGRAPHICTYPE_SVG, u".svg"},
    {TalGraphic::TLGRAPHICTYPE_PNG, u".png"},
};

constexpr char16_t jpegExtension[] = u".jpg";
constexpr char16_t pngExtension[] = u".png";

UnicodeString chooseExtension(TLGraphicType type) {
    const char16_t* const extension = findWord(extensions, type);
    return UnicodeString(extension ? extension : jpegExtension);
}

UnicodeString getStem(const UnicodeString& fileName) {
    MoxUri uri(fileName, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr);
    if (fileName.isEmpty() || !uri.isFile()) {
        return {};
    }
    uri.setExtension(nullptr);
    return uri.getFileName();
}

/// Returns: the number behind `counter`; the first one follows the last.
std::int32_t getNext(std::int32_t counter) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(counter) + 1U);
}

/// All bytes of a stream.
struct Bytes {
    std::unique_ptr<char[]> data;
    std::size_t size = 0;
};

/// Returns: nothing when the stream is missing or can't be read to its end.
std::optional<Bytes> readAll(std::istream* source) {
    const std::streamoff length = source ? SVGImageBytes::start(*source) : -1;
    if (length < 0) {
        return std::nullopt;
    }
    Bytes bytes;
    bytes.size = static_cast<std::size_t>(length);
    bytes.data.reset(new (std::nothrow) char[bytes.size]);
    const bool isRead =
        bytes.data && SVGImageBytes::read(*source, bytes.data.get(), bytes.size) == bytes.size;
    return isRead ? std::optional<Bytes>(std::move(bytes)) : std::nullopt;
}

} // namespace

UnicodeString SVGGraphicManager::makeCopyName(TLGraphicImage* image, const MoxUri& target,
                                              const UnicodeString& extension) const {
    const UnicodeString orgName = image->getOrgFileName();
    const UnicodeString entered = config->getEnteredImageName(orgName);
    // On purpose: the name follows the text of the directory as it stands; one without a slash at
    // its end becomes part of the file name.
    const UnicodeString directory = target.getLocalPath();
    if (!entered.isEmpty()) {
        return directory + entered;
    }
    const UnicodeString stem = getStem(orgName);
    const bool isCounted = stem.isEmpty() || config->imageProcessingName == MoxName(u"copy-all");
    const UnicodeString prefix = isCounted ? config->copyNamePrefix : stem;
    const UnicodeString ending =
        extension.isEmpty() ? chooseExtension(image->getGraphicType()) : extension;
    std::int32_t counter = isCounted ? getNext(config->copyNameCounter) : 0;
    UnicodeString name =
        prefix + (isCounted ? MoxUtil::toString(counter) : UnicodeString()) + ending;
    while (config->isEnteredImagename(name)) {
        counter = getNext(counter);
        name = prefix + MoxUtil::toString(counter) + ending;
    }
    config->enterImageName(stem, orgName, name);
    if (isCounted) {
        config->copyNameCounter = counter;
    }
    return directory + name;
}

UnicodeString SVGGraphicManager::copyImage(TLGraphicImage* image, const MoxUri& target) const {
    if (!findWord(extensions, image->getGraphicType())) {
        return convertImage(image, target);
    }
    return copyBytes(image, target, UnicodeString());
}

UnicodeString SVGGraphicManager::copyBytes(TLGraphicImage* image, const MoxUri& target,
                                           const UnicodeString& extension) const {
    const UnicodeString source = MoxUri::getLocalPath(image->getOrgFileName());
    UnicodeString path = makeCopyName(image, target, extension);
    if (!config->isCreatedOStream(path) && source != path) {
        writeCopy(image, path);
    }
    return path;
}

void SVGGraphicManager::writeCopy(TLGraphicImage* image, const UnicodeString& path) const {
    // The bytes come first: the file may be the image's own by another name, and opening empties
    // it.
    const std::optional<Bytes> bytes = readAll(image->getStream());
    std::ostream* const stream = bytes ? config->createOStream(path) : nullptr;
    if (!stream) {
        report(copyError, path);
        return;
    }
    stream->write(bytes->data.get(), static_cast<std::streamsize>(bytes->size));
    const bool isWritten = stream->flush().good();
    config->releaseOStream(stream);
    if (!isWritten) {
        report(copyError, path);
    }
}

UnicodeString SVGGraphicManager::convertImage(TLGraphicImage* image, const MoxUri& target) const {
    std::istream* const stream = image->getStream();
    if (!stream) {
        report(loadError);
        return image->getOrgFileName();
    }
    const GS_Graphic graphic(*stream, naturalResolution);
    if (!isUsable(graphic)) {
        return image->getOrgFileName();
    }
    IMAGE_CONVERT_TYPE type = CONVERT_BMP_JPEG;
    const bool isRequired = isRequiredImageConvert(graphic.raster, &type, /*force=*/false);
    const bool isJpeg = getCnvDstType(graphic.raster) == GRAPHICTYPE_JPEG;
    const UnicodeString extension(isJpeg ? jpegExtension : pngExtension);
    if (isRequired) {
        UnicodeString path = makeCopyName(image, target, extension);
        writeConverted(*graphic.raster, path, type);
        return path;
    }
    if (findWord(extensions, image->getGraphicType())) {
        copyBytes(image, target, UnicodeString());
        return image->getOrgFileName();
    }
    // A PNG or JPEG that its own record calls something else: copying it would lead back here, so
    // its bytes are copied as they are, and the path is that of the copy.
    return copyBytes(image, target, extension);
}

void SVGGraphicManager::writeConverted(GS_RasterImage& raster, const UnicodeString& path,
                                       IMAGE_CONVERT_TYPE type) const {
    if (path.indexOf(u'\0') >= 0) { // it would end the path early and name some other file
        report(copyError, path);
        return;
    }
    raster.writeToFile(MoxCStr(path).toCStr(), type, config->jpegQuality);
    if (raster.getFailure() == FAILURE_SOURCE) {
        report(loadError);
    } else if (raster.getFailure() == FAILURE_TARGET) {
        report(copyError, path);
    }
}

} // namespace DrawmereNS
