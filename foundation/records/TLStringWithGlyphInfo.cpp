#include "foundation/records/TLStringWithGlyphInfo.h"

#include <utility>

namespace TalFont {

TLStringWithGlyphInfo::TLStringWithGlyphInfo() = default;

TLStringWithGlyphInfo::TLStringWithGlyphInfo(std::vector<TLGlyphEntry> glyphEntries)
    : entries(std::move(glyphEntries)) {}

} // namespace TalFont
