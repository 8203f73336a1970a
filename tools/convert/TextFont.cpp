#include "tools/convert/TextFont.h"

#include "tools/convert/FillRules.h"
#include "tools/convert/FitzCall.h"

#include <ft2build.h>
#include FT_FREETYPE_H
#include FT_ADVANCES_H

#include <algorithm>
#include <cctype>

namespace DrawmereConvert {
namespace {

using MoxFontService_NS::FS_ExtraFont;

constexpr int regularWeight = 400;
constexpr int noWeight = 0; // written as nothing, as an embedded font is what it is

FT_Face faceOf(fz_context* ctx, fz_font* font) {
    return static_cast<FT_Face>(fz_font_ft_face(ctx, font));
}

/// Drops the mark of a subset: six capitals and a plus.
std::string dropSubsetMark(const std::string& name) {
    constexpr std::size_t markLength = 6;
    const bool isMarked = name.size() > markLength && name[markLength] == '+' &&
                          std::all_of(name.begin(), name.begin() + markLength,
                                      [](unsigned char c) { return std::isupper(c) != 0; });
    return isMarked ? name.substr(markLength + 1) : name;
}

/// Returns: what of `name` needs no quotes anywhere.
std::string keepPlain(const std::string& name) {
    std::string plain;
    std::ranges::copy_if(name, std::back_inserter(plain),
                         [](unsigned char c) { return c < 128 && std::isalnum(c) != 0; });
    const bool isStart = !plain.empty() && std::isalpha(static_cast<unsigned char>(plain[0])) != 0;
    return isStart ? plain : "F" + plain;
}

/// Returns: `name` without the style behind a hyphen or comma.
std::string dropStyle(const std::string& name) { return name.substr(0, name.find_first_of("-,")); }

/// Returns: a number of its own for each pair of ASCII characters.
std::optional<std::size_t> numberPair(char16_t first, char16_t second) {
    constexpr char16_t end = 128;
    if (first >= end || second >= end) {
        return std::nullopt;
    }
    return static_cast<std::size_t>(first) * end + second;
}

std::string makeDigest(fz_context* ctx, fz_font* font) {
    constexpr const char* digits = "0123456789abcdef";
    constexpr int shownBytes = 3;
    unsigned char digest[16] = {};
    callFitz(ctx, [&] { fz_font_digest(ctx, font, digest); });
    std::string text;
    for (int i = 0; i < shownBytes; ++i) {
        text += {digits[digest[i] >> 4U], digits[digest[i] & 15U]};
    }
    return text;
}

const char16_t* findGeneric(fz_context* ctx, fz_font* font) {
    if (fz_font_is_monospaced(ctx, font)) {
        return u"monospace";
    }
    return fz_font_is_serif(ctx, font) ? u"serif" : u"sans-serif";
}

void appendFamily(UnicodeString& list, const std::string& family) {
    UnicodeString text = UnicodeString::fromUTF8(family);
    text.findAndReplace(u"'", u"");
    if (text.indexOf(u' ') >= 0) {
        text = u"'" + text + u"'";
    }
    if (!text.isEmpty() && list.indexOf(text) < 0) {
        list += text + u",";
    }
}

} // namespace

TextFont::TextFont(fz_context* context, fz_font* newFont)
    : ctx(context), font(fz_keep_font(context, newFont)) {
    readNames();
}

TextFont::~TextFont() { fz_drop_font(ctx, font); }

void TextFont::readNames() {
    const std::string own = dropSubsetMark(fz_font_name(ctx, font));
    name = UnicodeString::fromUTF8(keepPlain(own) + "-" + makeDigest(ctx, font));
    appendFamily(family, dropStyle(own));
    const FT_Face face = faceOf(ctx, font);
    if (face && face->family_name) {
        appendFamily(family, face->family_name);
    }
    family += findGeneric(ctx, font);
}

bool TextFont::canEmbed() {
    if (!isTried) {
        isTried = true;
        files.push_back(loadFile(name));
    }
    return files.front() != nullptr;
}

UnicodeString TextFont::makeName(int variant) const {
    return variant == 0 ? name : name + u"-" + UnicodeString::fromUTF8(std::to_string(variant + 1));
}

std::unique_ptr<FS_ExtraFonts> TextFont::loadFile(const UnicodeString& fileName) const {
    const FT_Face face = faceOf(ctx, font);
    // What MuPDF draws fatter, slanted or narrower than the file says is no longer the font of the
    // file.
    const fz_font_flags_t& flags = font->flags;
    if (!face || !font->buffer || flags.fake_bold || flags.fake_italic ||
        (flags.ft_substitute && flags.ft_stretch)) {
        return nullptr;
    }
    unsigned char* data = nullptr;
    const std::size_t size = fz_buffer_storage(ctx, font->buffer, &data);
    FS_ExtraFont description;
    description.names = {fileName};
    description.weight = regularWeight;
    description.slant = MoxFontService_NS::FSSLANT_UPRIGHT;
    description.faceIndex = static_cast<int>(face->face_index & 0xFFFF);
    auto file = std::make_unique<FS_ExtraFonts>();
    const bool isRead =
        file->addBytes(std::string(reinterpret_cast<const char*>(data), size), description);
    return isRead ? std::move(file) : nullptr;
}

/// Returns: false when the text stands for another glyph, or would be one where its letters are
/// not.
bool TextFont::take(Variant& variant, const std::u16string& text, int glyph) {
    const auto known = variant.glyphs.find(text);
    if (known != variant.glyphs.end()) {
        return known->second == glyph;
    }
    std::vector<std::size_t> pairs;
    for (std::size_t i = 1; i < text.size(); ++i) {
        if (const std::optional<std::size_t> pair = numberPair(text[i - 1], text[i])) {
            pairs.push_back(*pair);
        }
    }
    if (std::ranges::any_of(pairs, [&](std::size_t pair) { return variant.loose.test(pair); })) {
        return false;
    }
    std::ranges::for_each(pairs, [&](std::size_t pair) { variant.inLigature.set(pair); });
    variant.glyphs.emplace(text, glyph);
    return true;
}

int TextFont::findVariant(const std::u16string& text, int glyph, int preferred) {
    const auto first = static_cast<std::size_t>(preferred);
    if (first < variants.size() && take(variants[first], text, glyph)) {
        return preferred;
    }
    std::size_t variant = 0;
    while (variant < variants.size() && !take(variants[variant], text, glyph)) {
        ++variant;
    }
    if (variant == variants.size()) {
        take(variants.emplace_back(), text, glyph);
    }
    return static_cast<int>(variant);
}

bool TextFont::joinLetters(int variant, char16_t first, char16_t second) {
    const std::optional<std::size_t> pair = numberPair(first, second);
    Variant& used = variants[static_cast<std::size_t>(variant)];
    if (!pair) {
        return true;
    }
    if (used.inLigature.test(*pair)) {
        return false;
    }
    used.loose.set(*pair);
    return true;
}

std::optional<int> TextFont::findBlank(int variant) {
    const Variant& used = variants[static_cast<std::size_t>(variant)];
    const auto known = used.glyphs.find(u" ");
    if (known != used.glyphs.end()) {
        return showsNothing(known->second) ? std::optional(known->second) : std::nullopt;
    }
    const FT_Face face = faceOf(ctx, font);
    for (const int glyph : {face ? static_cast<int>(FT_Get_Char_Index(face, U' ')) : 0, 0}) {
        if (showsNothing(glyph)) {
            return glyph;
        }
    }
    return std::nullopt;
}

bool TextFont::showsNothing(int glyph) {
    std::optional<bool>& answer = findGlyph(glyph).showsNothing;
    if (!answer) {
        const FT_Face face = faceOf(ctx, font);
        answer = face && FT_Load_Glyph(face, static_cast<FT_UInt>(glyph), FT_LOAD_NO_SCALE) == 0 &&
                 face->glyph->format == FT_GLYPH_FORMAT_OUTLINE &&
                 face->glyph->outline.n_contours == 0;
    }
    return *answer;
}

bool TextFont::isFilledAlike(int glyph) {
    std::optional<bool>& answer = findGlyph(glyph).isFilledAlike;
    if (!answer) {
        const FT_Face face = faceOf(ctx, font);
        answer = face && FT_Load_Glyph(face, static_cast<FT_UInt>(glyph), FT_LOAD_NO_SCALE) == 0 &&
                 face->glyph->format == FT_GLYPH_FORMAT_OUTLINE &&
                 DrawmereConvert::isFilledAlike(face->glyph->outline);
    }
    return *answer;
}

FS_ExtraFonts* TextFont::describe(int variant, float size, SVGFont& out) {
    const auto index = static_cast<std::size_t>(variant);
    while (files.size() <= index) {
        files.push_back(loadFile(makeName(static_cast<int>(files.size()))));
    }
    const UnicodeString fileName = makeName(variant);
    out.setFontAttribute(fileName, MoxCommonNS::MoxLength::fromRaw(size), noWeight,
                         DrawmereNS::FSTYLE_NORMAL, UnicodeString(), false);
    out.setEmbedAttribute(true, true);
    return files[index].get();
}

void TextFont::describePlain(float size, SVGFont& out) const {
    out.setFontAttribute(UnicodeString(), MoxCommonNS::MoxLength::fromRaw(size),
                         fz_font_is_bold(ctx, font) ? DrawmereNS::FONTWEIGHT_BOLD : noWeight,
                         fz_font_is_italic(ctx, font) ? DrawmereNS::FSTYLE_ITALIC
                                                      : DrawmereNS::FSTYLE_NORMAL,
                         UnicodeString(), true);
    out.fontFamily = family; // several names, of which only some need quotes
}

TextFont::Glyph& TextFont::findGlyph(int glyph) {
    const auto index = static_cast<std::size_t>(glyph);
    if (index >= knownGlyphs.size()) {
        knownGlyphs.resize(index + 1);
    }
    return knownGlyphs[index];
}

float TextFont::getAdvance(int glyph) {
    float& advance = findGlyph(glyph).advance;
    if (advance < 0) {
        const FT_Face face = faceOf(ctx, font);
        FT_Fixed units = 0;
        const bool isKnown =
            face && face->units_per_EM > 0 &&
            FT_Get_Advance(face, static_cast<FT_UInt>(glyph), FT_LOAD_NO_SCALE, &units) == 0;
        advance = isKnown ? static_cast<float>(units) / static_cast<float>(face->units_per_EM) : 0;
    }
    return advance;
}

std::optional<float> TextFont::findStretchedWidth(int glyph) const {
    constexpr float units = 1000.0F;
    if (!font->flags.ft_stretch || !font->width_table) {
        return std::nullopt;
    }
    const bool isListed = glyph >= 0 && glyph < font->width_count;
    return static_cast<float>(isListed ? font->width_table[glyph] : font->width_default) / units;
}

TextFont& FontBook::find(fz_font* font) {
    std::unique_ptr<TextFont>& entry = fonts[font];
    if (!entry) {
        entry = std::make_unique<TextFont>(ctx, font);
    }
    return *entry;
}

void FontBook::startDocument() {
    if (fonts.size() > maxFonts) {
        fonts.clear();
    }
    for (const auto& font : fonts) {
        font.second->startDocument();
    }
}

} // namespace DrawmereConvert
