#include "foundation/fontservice/FS_FontInfo.h"

#include "foundation/fontservice/FS_FoundFace.h"

namespace MoxFontService_NS {

namespace {

constexpr int neutralUnitsPerEm = 1000;
constexpr int neutralWeight = 400;
constexpr int neutralWidthClass = 5;

} // namespace

FS_FontInfo::FS_FontInfo() = default;

FS_FontInfo::FS_FontInfo(const FS_FontInfo& other) = default;

FS_FontInfo& FS_FontInfo::operator=(const FS_FontInfo& other) = default;

FS_FontInfo::~FS_FontInfo() = default;

bool FS_FontInfo::isCreatedFont() const { return found != nullptr; }

bool FS_FontInfo::createFont(const UnicodeString& /*name*/, int /*weight*/, bool /*italic*/,
                             int /*widthClass*/, FS_ExtraFonts* /*extra*/, bool /*reserved*/) {
    return false;
}

UnicodeString FS_FontInfo::getFamilyName(MoxLang::LanguageID /*language*/) const { return {}; }

void FS_FontInfo::getFontStyle(int* weight, bool* italic, int* widthClass) const {
    if (weight) {
        *weight = neutralWeight;
    }
    if (italic) {
        *italic = false;
    }
    if (widthClass) {
        *widthClass = neutralWidthClass;
    }
}

int FS_FontInfo::getUnitsPerEm() const { return neutralUnitsPerEm; }

unsigned short FS_FontInfo::getGlyphID(int /*codePoint*/, bool /*vertical*/) const {
    return noGlyph;
}

bool FS_FontInfo::getGlyphDrawInfo(unsigned short /*glyphId*/, FS_GlyphDrawInfo& info,
                                   bool /*reserved*/) const {
    info = FS_GlyphDrawInfo();
    return false;
}

float FS_FontInfo::getDefaultCharWidth(int /*reserved*/) const { return 0.0F; }

void FS_FontInfo::getOutlineTextMetrics(FS_NewTextMetricEx& metrics, int /*size*/) const {
    metrics = FS_NewTextMetricEx();
}

} // namespace MoxFontService_NS
