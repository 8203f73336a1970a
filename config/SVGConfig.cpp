#include "SVGConfig.h"

#include <cstddef>

#include <unicode/uchar.h>

#include "foundation/common/MoxBogusString.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxObjectBase.h"
#include "foundation/common/MoxWord.h"
#include "foundation/records/TLGraphicImage.h"

namespace DrawmereNS {

using MoxCommonNS::MoxBogusString;
using MoxCommonNS::MoxNameTable;
using MoxCommonNS::MoxWord;

namespace {

constexpr float lengthLimit = 32768.0F;
constexpr char16_t comma = u',';

constexpr MoxWord<SVGConfig::IMAGEPROCESSING> imageProcessingWords[] = {
    {SVGConfig::IMAGEPROCESSING_EMBED_ALL, u"embed-all"},
    {SVGConfig::IMAGEPROCESSING_LINK, u"link"},
    {SVGConfig::IMAGEPROCESSING_COPY_ALL, u"copy-all"},
    {SVGConfig::IMAGEPROCESSING_COPY, u"copy"},
};

constexpr MoxWord<SVGConfig::IMAGECONVERSION> imageConversionWords[] = {
    {SVGConfig::IMAGECONVERSION_AUTO, u"auto"},
    {SVGConfig::IMAGECONVERSION_JPEG, u"jpeg"},
    {SVGConfig::IMAGECONVERSION_JPEG, u"jpg"},
    {SVGConfig::IMAGECONVERSION_PNG, u"png"},
    {SVGConfig::IMAGECONVERSION_JPEG_ALL, u"jpg-all"},
    {SVGConfig::IMAGECONVERSION_PNG_ALL, u"png-all"},
};

/// Returns: the number of the row with the text of `name`; the first row's for an unlisted one.
template <typename Key, std::size_t count>
Key findKey(const MoxWord<Key> (&table)[count], const MoxName& name) {
    const UnicodeString& text = MoxNameTable::getSharedNameString(name);
    for (const MoxWord<Key>& row : table) {
        if (text == UnicodeString(row.word)) {
            return row.key;
        }
    }
    return table[0].key;
}

UnicodeString getFileNameOf(const TalGraphic::TLGraphicImage* image) {
    return image ? image->getOrgFileName() : UnicodeString();
}

/// Returns: whether a document can refer to the image's file as it is.
bool isReferable(TalGraphic::TLGraphicImage* image) {
    if (!image) {
        return false;
    }
    const TalGraphic::TLGraphicType type = image->getGraphicType();
    return type == TalGraphic::TLGRAPHICTYPE_PNG || type == TalGraphic::TLGRAPHICTYPE_JPEG ||
           type == TalGraphic::TLGRAPHICTYPE_SVG;
}

std::int32_t skipBlanks(const UnicodeString& text, std::int32_t index) {
    while (index < text.length() && u_isWhitespace(text.charAt(index))) {
        ++index;
    }
    return index;
}

/// Finds the name that begins at `begin` in `list` and takes it into `names`.
/// Returns: where the search goes on, at the comma behind the name or at the end.
std::int32_t takeFontName(const UnicodeString& list, std::int32_t begin,
                          std::set<UnicodeString>& names) {
    const std::int32_t next = list.indexOf(comma, begin);
    // On purpose: the name loses the character before its comma, which the caller supplies as a
    // blank. Without this rule "Arial,Times" would embed Arial, which it does not.
    const std::int32_t end = next < 0 ? list.length() : next - 1;
    UnicodeString name(list, begin, end - begin);
    name.trim();
    if (!name.isEmpty()) {
        names.insert(name);
    }
    return next < 0 ? list.length() : next;
}

void initDocumentOptions(SVGConfig& config) {
    config.encoding.remove();
    config.svgType = SVGConfig::SVGTYPE_FULL;
    config.svgVersion = u"1.1";
    config.numberFormatDefault = u"1";
    config.keepGroups = true;
    config.unsetText = MoxBogusString::BOGUS_VALUE;
    config.saveOption.remove();
    config.reservedFlag = false;
    config.maxLength = 0.0F;
    config.limitValue = 5000;
    config.colorFlag = true;
}

void initOutputOptions(SVGConfig& config) {
    config.gzip = false;
    config.streamOutput = true;
    config.checkPaths = false;
    config.svgOutputUri = MoxBogusString::BOGUS_VALUE;
    config.singleFile = false;
    config.wispMode = false;
    config.wispOptions.remove();
    config.keepPageNumber = false;
}

void initFontOptions(SVGConfig& config) {
    config.embedAllFonts = false;
    config.embedFontNames.clear();
}

void initImageOptions(SVGConfig& config) {
    config.setImageProcessingType(MoxName(UnicodeString(u"embed-all")));
    config.setImageConversion(MoxName(UnicodeString(u"auto")));
    config.jpegQuality = 80;
    config.imageBaseUri = MoxBogusString::BOGUS_VALUE;
    config.imageCopyUri = u"./";
    config.downsampleDpi = 0;
    config.downsampleThreshold = 1;
    config.downsampleType = 1;
    config.copyNamePrefix.remove();
}

} // namespace

SVGConfig::SVGConfig() { init(); }

// On purpose: reads nothing of its argument, so a configuration that is copied by accident shares
// neither open streams nor the owned object with the other.
SVGConfig::SVGConfig(const SVGConfig&) {}

// On purpose: leaves the streams that are still open alone, since their users may outlive this.
SVGConfig::~SVGConfig() {
    if (ownsObject) {
        delete ownedObject;
    }
}

void SVGConfig::init() {
    initDocumentOptions(*this);
    initOutputOptions(*this);
    initFontOptions(*this);
    initImageOptions(*this);
    initImageName();
    // On purpose: forgets the object and the streams without deleting them, since what owns them
    // now may be the caller; errors and created files stay for the caller to read.
    ownedObject = nullptr;
    ownsObject = false;
    streamsByName.clear();
    namesByStream.clear();
}

void SVGConfig::adjustConfig() {
    const bool isTooLarge = svgType != SVGTYPE_FULL && maxLength > lengthLimit;
    if (maxLength <= 0.0F || isTooLarge) {
        maxLength = lengthLimit;
    }
    if (wispMode) {
        setImageConversion(MoxName(UnicodeString(u"jpg-all")));
    }
}

void SVGConfig::setImageConversion(const MoxName& name) {
    imageConversionName = name;
    imageConversion = findKey(imageConversionWords, name);
}

void SVGConfig::setImageProcessingType(const MoxName& name) {
    imageProcessingName = name;
    imageProcessing = findKey(imageProcessingWords, name);
}

void SVGConfig::setEmbedFonts(const UnicodeString& list) {
    embedFontNames.clear();
    UnicodeString trimmed(list);
    trimmed.trim();
    std::int32_t index = 0;
    while (index < trimmed.length()) {
        index = skipBlanks(trimmed, index);
        if (trimmed.charAt(index) == comma) {
            ++index;
        } else {
            index = takeFontName(trimmed, index, embedFontNames);
        }
    }
}

bool SVGConfig::isEmbedFont(const UnicodeString& name) {
    return embedAllFonts || embedFontNames.contains(name);
}

bool SVGConfig::isEmbedImage(TalGraphic::TLGraphicImage* image) const {
    switch (imageProcessing) {
    case IMAGEPROCESSING_COPY_ALL:
        return false;
    case IMAGEPROCESSING_COPY:
        return getFileNameOf(image).isEmpty();
    case IMAGEPROCESSING_LINK:
        return !isReferable(image) || getFileNameOf(image).isEmpty();
    default:
        return true;
    }
}

bool SVGConfig::isCopyImage(TalGraphic::TLGraphicImage* image) const {
    switch (imageProcessing) {
    case IMAGEPROCESSING_EMBED_ALL:
    case IMAGEPROCESSING_LINK:
        return false;
    case IMAGEPROCESSING_COPY:
        return !getFileNameOf(image).isEmpty();
    default:
        return true;
    }
}

UnicodeString SVGConfig::findValue(const UnicodeString& options, const UnicodeString& key) const {
    if (options.isEmpty()) {
        return UnicodeString();
    }
    const UnicodeString work = UnicodeString(comma) + options;
    const UnicodeString needle = UnicodeString(comma) + key + UnicodeString(u'=');
    const std::int32_t found = work.indexOf(needle);
    if (found < 0) {
        return UnicodeString();
    }
    const std::int32_t begin = found + needle.length();
    const std::int32_t next = work.indexOf(comma, begin);
    const std::int32_t end = next < 0 ? work.length() : next;
    return UnicodeString(work, begin, end - begin);
}

bool SVGConfig::hasError() const { return !errors.empty(); }

void SVGConfig::pushError(const MoxError& error) { errors.push_back(error); }

MoxError SVGConfig::popError() {
    if (errors.empty()) {
        return MoxError();
    }
    const MoxError newest = errors.back();
    errors.pop_back();
    return newest;
}

void SVGConfig::clearError() { errors.clear(); }

} // namespace DrawmereNS
