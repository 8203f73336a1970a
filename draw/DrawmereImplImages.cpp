// Image calls: where an image goes, and by which path the document refers to it.
#include "draw/DrawmereImpl.h"

#include "SVGConfig.h"
#include "foundation/common/MoxUri.h"
#include "foundation/records/TLGraphicImage.h"
#include "frontend/DrawmereError.h"
#include "tree/SVGTreeManager.h"

#include <algorithm>

namespace DrawmereNS {
namespace {

using MoxCommonNS::MoxUri;

constexpr char16_t dirMark = u'/';
constexpr unsigned short noDirectoryError = 16413;

MoxUri makeUri(const UnicodeString& text) {
    return {text, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr};
}

std::int32_t findCommonLength(const UnicodeString& one, const UnicodeString& other) {
    const std::u16string_view view = viewOf(one);
    const std::u16string_view otherView = viewOf(other);
    const auto [end, otherEnd] =
        std::mismatch(view.begin(), view.end(), otherView.begin(), otherView.end());
    return static_cast<std::int32_t>(end - view.begin());
}

std::int32_t countDirMarks(const UnicodeString& text, std::int32_t begin, std::int32_t end) {
    const std::u16string_view part = viewOf(text).substr(begin, end - begin);
    return static_cast<std::int32_t>(std::count(part.begin(), part.end(), dirMark));
}

/// Returns: `path` as the document at `output` refers to it. What has nothing but the root of a
/// file system or a scheme in common with the document keeps its path.
UnicodeString makeRelative(const UnicodeString& path, const UnicodeString& output) {
    constexpr std::int32_t leastDirMarks = 2;
    const MoxUri uri = makeUri(path);
    const UnicodeString imageBase = uri.getBaseString();
    const UnicodeString outputBase = makeUri(output).getBaseString();
    if (imageBase == outputBase) {
        return uri.getFileName();
    }
    const std::int32_t common = findCommonLength(imageBase, outputBase);
    if (countDirMarks(imageBase, 0, common) < leastDirMarks) {
        return path;
    }
    UnicodeString relative;
    for (std::int32_t up = countDirMarks(outputBase, common, outputBase.length()); up > 0; --up) {
        relative.append(u"../", -1);
    }
    if (relative.isEmpty()) {
        relative = u"./";
    }
    const std::int32_t tail = imageBase.lastIndexOf(dirMark, 0, common) + 1;
    return relative + UnicodeString(imageBase, tail) + uri.getFileName();
}

/// Returns: the path of a copy as the document refers to it.
UnicodeString makeCopyHref(const UnicodeString& path, const UnicodeString& copyUri) {
    if (makeUri(copyUri).isAbsolute()) {
        return path;
    }
    UnicodeString directory = copyUri;
    MoxUri::toDirectory(directory, dirMark);
    return directory + makeUri(path).getFileName();
}

} // namespace

void DrawmereImpl::drawImage(TLGraphicImage* image, const MoxLength& width, const MoxLength& height,
                             const MoxLength& x, const MoxLength& y) {
    if (!image || !treeManager->getCurrentNode()) {
        return;
    }
    if (config->isEmbedImage(image)) {
        graphicManager.embedGraphic(image, width, height, x, y);
        return;
    }
    const UnicodeString href = config->isCopyImage(image)
                                   ? makeCopyHref(copyImage(image), config->imageCopyUri)
                                   : makeRelative(image->getOrgFileName(), config->svgOutputUri);
    graphicManager.referGraphic(href, width, height, x, y);
}

UnicodeString DrawmereImpl::copyImage(TLGraphicImage* image) {
    if (!image) {
        return {};
    }
    const UnicodeString& copyUri = config->imageCopyUri;
    MoxUri directory = makeUri(copyUri);
    if (!directory.isAbsolute()) {
        const MoxUri base = makeUri(makeUri(config->svgOutputUri).getBaseString());
        directory = MoxUri(base, copyUri, MoxCommonNS::URISTRTYPE_PATH_OR_URI, nullptr);
    }
    if (!directory.isFileExists()) {
        DrawmereError::throwError(noDirectoryError, copyUri);
    }
    return graphicManager.copyImage(image, directory);
}

} // namespace DrawmereNS
