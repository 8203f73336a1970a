#include "foundation/fontservice/FS_ExtraFonts.h"

#include "foundation/fontservice/FS_ExtraFontList.h"

#include <utility>

namespace MoxFontService_NS {

FS_ExtraFonts::FS_ExtraFonts() : fonts(std::make_unique<FS_ExtraFontList>()) {}

FS_ExtraFonts::FS_ExtraFonts(const FS_ExtraFonts& other)
    : fonts(std::make_unique<FS_ExtraFontList>(*other.fonts)) {}

FS_ExtraFonts& FS_ExtraFonts::operator=(const FS_ExtraFonts& other) {
    *fonts = *other.fonts;
    return *this;
}

FS_ExtraFonts::~FS_ExtraFonts() = default;

bool FS_ExtraFonts::addFile(const UnicodeString& path, const FS_ExtraFont& font) {
    FS_FontSource source;
    path.toUTF8String(source.path);
    return fonts->add(source, font);
}

bool FS_ExtraFonts::addBytes(std::string bytes, const FS_ExtraFont& font) {
    FS_FontSource source;
    source.bytes = std::make_shared<const std::string>(std::move(bytes));
    return fonts->add(source, font);
}

int FS_ExtraFonts::count() const { return fonts->count(); }

} // namespace MoxFontService_NS
