#include "fonts/SVGEmbFont.h"

#include <algorithm>
#include <iterator>

#include <unicode/utf16.h>

namespace DrawmereNS {
namespace {

using TalFont::TLGlyphEntry;

constexpr int normalWidthClass = 5;

/// The width classes from the stretch -8 on, by which the font service chooses a face. Every other
/// stretch is of normal width, also "wider" and "narrower", which ask for no width of their own.
constexpr int widthClasses[] = {1, 2, 3, 4, 6, 7, 8, 9};

int getWidthClass(FONTSTRECH stretch) {
    const std::int64_t place = std::int64_t{stretch} - FONTSTRECH_ULTRACONDENSED;
    const bool listed = place >= 0 && place < std::ssize(widthClasses);
    return listed ? widthClasses[place] : normalWidthClass;
}

UnicodeString makeErrorMessage(const FONTATTRIBUTE& font) {
    SVGFontAttr2String::FONTATTRSTRING words;
    SVGFontAttr2String::getFontAttrStr(font, words);
    UnicodeString text(u"  Create font error:\n");
    text.append(u"    Font name:").append(words.fontName).append(u'\n');
    text.append(u"    Font weight:").append(words.fontWeight).append(u'\n');
    return text.append(u"    Font variant:").append(words.fontVariant).append(u'\n');
}

/// Returns: the part of `text` that begins at `offset`, as much of it as there is.
std::u16string_view cut(std::u16string_view text, std::int64_t offset, std::int64_t count) {
    const auto size = static_cast<std::int64_t>(text.size());
    if (offset >= 0 && count > 0 && offset + count <= size) {
        return {text.data() + offset, static_cast<std::size_t>(count)};
    }
    const std::int64_t begin = std::clamp<std::int64_t>(offset, 0, size);
    return text.substr(begin, std::clamp<std::int64_t>(count, 0, size - begin));
}

} // namespace

SVGEmbFont::SVGEmbFont(const SVGFont& font, FS_ExtraFonts* extraFonts)
    : fontAttribute(font), faceFamily(font.fontFamily),
      errorHandler(DrawmereErrHandler::getDefault()) {
    loadFont(extraFonts);
}

SVGEmbFont::~SVGEmbFont() = default;

bool SVGEmbFont::loadFont(FS_ExtraFonts* extraFonts) {
    if (fontInfo.isCreatedFont()) {
        return true;
    }
    const bool created = fontInfo.createFont(fontAttribute.fontName, fontAttribute.fontWeight,
                                             fontAttribute.fontStyle != FSTYLE_NORMAL,
                                             getWidthClass(fontAttribute.fontStretch), extraFonts,
                                             /*reserved=*/true);
    if (!created) {
        errorMessage.append(makeErrorMessage(fontAttribute));
    }
    return true;
}

bool SVGEmbFont::isSameFont(SVGEmbFont& other) {
    if (fontInfo.getFamilyName(MoxCommonNS::MoxLang::LANGUAGE_UNSTATED) !=
        other.fontInfo.getFamilyName(MoxCommonNS::MoxLang::LANGUAGE_UNSTATED)) {
        return false;
    }
    int weight = 0;
    int otherWeight = 0;
    bool italic = false;
    bool otherItalic = false;
    fontInfo.getFontStyle(&weight, &italic, nullptr);
    other.fontInfo.getFontStyle(&otherWeight, &otherItalic, nullptr);
    return weight == otherWeight && italic == otherItalic;
}

void SVGEmbFont::forgetCharacters() {
    horizontalCharacters.clear();
    verticalCharacters.clear();
    notedTexts = countTexts();
}

void SVGEmbFont::embedText(const UnicodeString& text, bool vertical) {
    if (!fontInfo.isCreatedFont()) {
        return; // and nothing is remembered that a face which comes late may have
    }
    if (notedTexts != countTexts()) {
        forgetCharacters();
    }
    SVGCodePointSet& known = vertical ? verticalCharacters : horizontalCharacters;
    const std::u16string_view units = viewOf(text);
    std::size_t end = known.skipKnown(units, 0);
    while (end < units.size()) {
        const std::size_t begin = end;
        std::int32_t codePoint = 0;
        U16_NEXT(units.data(), end, units.size(), codePoint);
        if (!known.contains(static_cast<std::uint32_t>(codePoint))) {
            embedCodePoint(codePoint, units.substr(begin, end - begin), vertical);
        }
        if (!U_IS_SURROGATE(codePoint)) { // half of a pair must not hide the whole
            known.insert(static_cast<std::uint32_t>(codePoint));
        }
        end = known.skipKnown(units, end);
    }
}

void SVGEmbFont::embedCodePoint(std::int32_t codePoint, std::u16string_view text, bool vertical) {
    const std::uint16_t glyphId = fontInfo.getGlyphID(codePoint, /*vertical=*/false);
    if (glyphId == TLGlyphEntry::noGlyph) {
        return;
    }
    std::uint16_t chosen = glyphId;
    bool stands = false;
    if (vertical) {
        const std::uint16_t standing = fontInfo.getGlyphID(codePoint, /*vertical=*/true);
        stands = standing != glyphId && standing != TLGlyphEntry::noGlyph;
        chosen = stands ? standing : glyphId;
    }
    // On purpose: a character without a form of its own for vertical text is horizontal there too.
    if (SVGGlyphMap::value_type* added = add(text, stands)) {
        added->second.push_back(chosen);
    }
}

void SVGEmbFont::embedGlyphId(const UnicodeString& text, const TLStringWithGlyphInfo* glyphs,
                              bool wholeRun, bool vertical) {
    if (!glyphs) {
        return;
    }
    if (wholeRun) {
        embedRun(viewOf(text), *glyphs, vertical);
    } else {
        embedClusters(viewOf(text), *glyphs, vertical);
    }
}

void SVGEmbFont::embedClusters(std::u16string_view text, const TLStringWithGlyphInfo& glyphs,
                               bool vertical) {
    const SVGGlyphIndex& index = followMap(vertical);
    SVGGlyphMap::value_type* added = nullptr;
    std::int64_t offset = 0;
    for (const TLGlyphEntry& entry : glyphs.entries) {
        if (entry.charCount != 0) {
            const std::u16string_view cluster = cut(text, offset, entry.charCount);
            offset += entry.charCount;
            added = index.knows(cluster) ? nullptr : add(cluster, vertical);
            if (added) {
                added->second.push_back(entry.glyphId);
            }
        } else if (added && entry.glyphId != TLGlyphEntry::noGlyph) {
            added->second.push_back(entry.glyphId);
        }
    }
}

void SVGEmbFont::embedRun(std::u16string_view text, const TLStringWithGlyphInfo& glyphs,
                          bool vertical) {
    SVGGlyphMap::value_type* added =
        followMap(vertical).knows(text) ? nullptr : add(text, vertical);
    if (!added) {
        return;
    }
    for (const TLGlyphEntry& entry : glyphs.entries) {
        if (entry.glyphId != TLGlyphEntry::noGlyph) {
            added->second.push_back(entry.glyphId);
        }
    }
}

const SVGGlyphIndex& SVGEmbFont::followMap(bool vertical) {
    SVGGlyphIndex& index = vertical ? verticalIndex : horizontalIndex;
    index.follow(vertical ? verticalGlyphs : horizontalGlyphs);
    return index;
}

SVGGlyphMap::value_type* SVGEmbFont::add(std::u16string_view text, bool vertical) {
    SVGGlyphMap& glyphs = vertical ? verticalGlyphs : horizontalGlyphs;
    const auto [entry, added] = glyphs.try_emplace(SVGEmbTLString(text));
    if (!added) {
        return nullptr;
    }
    (vertical ? verticalIndex : horizontalIndex).add(glyphs, *entry);
    ++notedTexts;
    return &*entry;
}

UnicodeString SVGEmbFont::getErrorMessage() const { return errorMessage; }

} // namespace DrawmereNS
