#include "foundation/fontservice/FS_ExtraFonts.h"

#include "foundation/fontservice/FS_ExtraFontList.h"

namespace MoxFontService_NS {

FS_ExtraFonts::FS_ExtraFonts() : fonts(std::make_unique<FS_ExtraFontList>()) {}

FS_ExtraFonts::FS_ExtraFonts(const FS_ExtraFonts& other)
    : fonts(std::make_unique<FS_ExtraFontList>(*other.fonts)) {}

FS_ExtraFonts& FS_ExtraFonts::operator=(const FS_ExtraFonts& other) {
    *fonts = *other.fonts;
    return *this;
}

FS_ExtraFonts::~FS_ExtraFonts() = default;

bool FS_ExtraFonts::addFile(const UnicodeString& /*path*/, const FS_ExtraFont& /*font*/) {
    return false;
}

bool FS_ExtraFonts::addBytes(std::string /*bytes*/, const FS_ExtraFont& /*font*/) { return false; }

int FS_ExtraFonts::count() const { return static_cast<int>(fonts->entries.size()); }

} // namespace MoxFontService_NS
