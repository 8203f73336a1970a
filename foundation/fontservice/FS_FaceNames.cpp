#include "foundation/fontservice/FS_FaceNames.h"

#include <algorithm>
#include <iterator>

#include <unicode/unistr.h>

#include FT_SFNT_NAMES_H
#include FT_TRUETYPE_IDS_H

namespace MoxFontService_NS {

namespace {

// The names by which a face may be asked for, of all those in the table.
constexpr FT_UShort askedNames[] = {
    TT_NAME_ID_FONT_FAMILY,        TT_NAME_ID_FULL_NAME,     TT_NAME_ID_PS_NAME,
    TT_NAME_ID_TYPOGRAPHIC_FAMILY, TT_NAME_ID_MAC_FULL_NAME,
};

// A table of names may claim any count and any length.
constexpr FT_UInt mostNames = 1000;
constexpr FT_UInt mostNameBytes = 1000;

UnicodeString decodeUtf16(const FT_SfntName& name) {
    UnicodeString text;
    for (FT_UInt i = 0; i + 1 < name.string_len; i += 2) {
        text.append(static_cast<char16_t>(name.string[i] << 8U | name.string[i + 1]));
    }
    return text;
}

// Empty for what is in an encoding of old: such fonts say the same in Unicode.
UnicodeString decode(const FT_SfntName& name) {
    if (name.string_len > mostNameBytes) {
        return {};
    }
    if (name.platform_id == TT_PLATFORM_MICROSOFT ||
        name.platform_id == TT_PLATFORM_APPLE_UNICODE) {
        return decodeUtf16(name);
    }
    if (name.platform_id == TT_PLATFORM_MACINTOSH && name.encoding_id == TT_MAC_ID_ROMAN) {
        const auto* bytes = reinterpret_cast<const char*>(name.string);
        return {bytes, static_cast<std::int32_t>(name.string_len), "macintosh"};
    }
    return {};
}

bool isEnglish(const FT_SfntName& name) {
    return name.platform_id == TT_PLATFORM_MICROSOFT
               ? name.language_id == TT_MS_LANGID_ENGLISH_UNITED_STATES
               : name.language_id == TT_MAC_LANGID_ENGLISH;
}

std::vector<FT_SfntName> readRecords(FT_Face face) {
    std::vector<FT_SfntName> records;
    const FT_UInt count = std::min(FT_Get_Sfnt_Name_Count(face), mostNames);
    for (FT_UInt i = 0; i < count; ++i) {
        FT_SfntName record = {};
        if (FT_Get_Sfnt_Name(face, i, &record) == 0) {
            records.push_back(record);
        }
    }
    return records;
}

UnicodeString readCString(const char* text) {
    return text ? UnicodeString::fromUTF8(text) : UnicodeString();
}

void appendOnce(std::vector<UnicodeString>& names, const UnicodeString& name) {
    if (!name.isEmpty() && std::ranges::find(names, name) == names.end()) {
        names.push_back(name);
    }
}

} // namespace

// A family that has further widths or weights gives them a family name of their own here, which the
// name FreeType prefers does not.
UnicodeString readFamilyName(FT_Face face) {
    UnicodeString family;
    for (const FT_SfntName& record : readRecords(face)) {
        if (record.name_id != TT_NAME_ID_FONT_FAMILY || (!family.isEmpty() && !isEnglish(record))) {
            continue;
        }
        UnicodeString name = decode(record);
        if (!name.isEmpty()) {
            family = std::move(name);
        }
    }
    if (family.isEmpty()) {
        family = readCString(face->family_name);
    }
    return family.isEmpty() ? readCString(FT_Get_Postscript_Name(face)) : family;
}

std::vector<UnicodeString> readNames(FT_Face face) {
    std::vector<UnicodeString> names;
    appendOnce(names, readFamilyName(face));
    for (const FT_SfntName& record : readRecords(face)) {
        if (std::ranges::find(askedNames, record.name_id) != std::end(askedNames)) {
            appendOnce(names, decode(record));
        }
    }
    appendOnce(names, readCString(face->family_name));
    appendOnce(names, readCString(FT_Get_Postscript_Name(face)));
    return names;
}

} // namespace MoxFontService_NS
