#include "foundation/fontservice/FS_FontInfo.h"

#include "foundation/fontservice/FS_ExtraFontList.h"
#include "foundation/fontservice/FS_FoundFace.h"
#include "foundation/fontservice/FS_SystemFonts.h"

#include <cstdlib>
#include <limits>
#include <optional>
#include <utility>

namespace MoxFontService_NS {

namespace {

constexpr int neutralUnitsPerEm = 1000;

int saturatedAbs(int number) {
    return number == std::numeric_limits<int>::min() ? std::numeric_limits<int>::max()
                                                     : std::abs(number);
}

} // namespace

FS_FontInfo::FS_FontInfo() = default;

FS_FontInfo::FS_FontInfo(const FS_FontInfo& other) = default;

FS_FontInfo& FS_FontInfo::operator=(const FS_FontInfo& other) = default;

FS_FontInfo::~FS_FontInfo() = default;

bool FS_FontInfo::isCreatedFont() const { return found != nullptr; }

bool FS_FontInfo::createFont(const UnicodeString& name, int weight, bool italic, int widthClass,
                             FS_ExtraFonts* extra, bool /*reserved*/) {
    const FS_FaceStyle wanted = makeStyle(weight, italic, widthClass);
    std::optional<FS_FoundName> place;
    if (extra) {
        place = extra->fonts->find(name, wanted);
    }
    if (!place) {
        place = FS_SystemFonts::shared().find(name, wanted);
    }
    std::shared_ptr<const FS_FoundFace> opened = place ? FS_FoundFace::open(*place) : nullptr;
    if (!opened) {
        return false;
    }
    found = std::move(opened);
    return true;
}

UnicodeString FS_FontInfo::getFamilyName(MoxLang::LanguageID /*language*/) const {
    return found ? found->familyName : UnicodeString();
}

void FS_FontInfo::getFontStyle(int* weight, bool* italic, int* widthClass) const {
    const FS_FaceStyle style = found ? found->style : FS_FaceStyle();
    if (weight) {
        *weight = style.weight;
    }
    if (italic) {
        *italic = style.italic;
    }
    if (widthClass) {
        *widthClass = style.widthClass;
    }
}

int FS_FontInfo::getUnitsPerEm() const {
    return found ? found->face->unitsPerEm : neutralUnitsPerEm;
}

unsigned short FS_FontInfo::getGlyphID(int codePoint, bool vertical) const {
    return found ? found->face->findGlyph(codePoint, vertical) : noGlyph;
}

bool FS_FontInfo::getGlyphDrawInfo(unsigned short glyphId, FS_GlyphDrawInfo& info,
                                   bool /*reserved*/) const {
    if (found) {
        return found->face->readGlyph(glyphId, info);
    }
    info = FS_GlyphDrawInfo();
    return false;
}

float FS_FontInfo::getDefaultCharWidth(int /*reserved*/) const {
    FS_GlyphDrawInfo info;
    if (getGlyphDrawInfo(0, info, /*reserved=*/false)) {
        return static_cast<float>(info.horizontalAdvance);
    }
    FS_NewTextMetricEx metrics;
    getOutlineTextMetrics(metrics, 0);
    return static_cast<float>(metrics.averageCharWidth);
}

void FS_FontInfo::getOutlineTextMetrics(FS_NewTextMetricEx& metrics, int size) const {
    metrics = FS_NewTextMetricEx();
    const int unitsWanted = size == 0 ? getUnitsPerEm() : saturatedAbs(size);
    metrics.unitsPerEm = unitsWanted;
    if (found) {
        found->face->readMetrics(metrics, unitsWanted);
        metrics.weight = found->style.weight;
        metrics.italic = found->style.italic;
    }
}

} // namespace MoxFontService_NS
