#include "foundation/fontservice/FS_ExtraFontList.h"

#include "foundation/fontservice/FS_FaceCache.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include <unicode/uchar.h>

namespace MoxFontService_NS {

namespace {

// Numbers that state nothing become 0.
FS_StatedStyle readStated(const FS_ExtraFont& font) {
    const FS_FaceStyle style = makeStyle(font.weight, false, font.widthClass);
    FS_StatedStyle stated;
    stated.weight = style.weight == font.weight ? font.weight : 0;
    stated.slant = font.slant;
    stated.widthClass = style.widthClass == font.widthClass ? font.widthClass : 0;
    return stated;
}

std::vector<UnicodeString> readGivenNames(const FS_ExtraFont& font) {
    std::vector<UnicodeString> names = font.names;
    std::erase_if(names, [](const UnicodeString& name) { return name.isEmpty(); });
    return names;
}

bool haveSameWidths(const FS_StyleRange& a, const FS_StyleRange& b) {
    return a.least.widthClass == b.least.widthClass && a.most.widthClass == b.most.widthClass;
}

bool isExact(const UnicodeString& a, const UnicodeString& b) { return a == b; }

bool isSameFolded(const UnicodeString& a, const UnicodeString& b) {
    return a.caseCompare(b, U_FOLD_CASE_DEFAULT) == 0;
}

} // namespace

bool FS_ExtraFontList::add(const FS_FontSource& source, const FS_ExtraFont& font) {
    constexpr int mostFaces = 0xFFFF; // more would name an instance of a variable font
    if (font.faceIndex < 0 || font.faceIndex > mostFaces) {
        return false;
    }
    const auto face = FS_FaceCache::shared().find({source, font.faceIndex, std::nullopt});
    if (!face) {
        return false;
    }
    std::vector<UnicodeString> names = readGivenNames(font);
    if (names.empty()) {
        names = face->readAllNames();
    }
    if (names.empty()) {
        return false;
    }
    const FS_StatedStyle stated = readStated(font);
    const FS_StyleRange range = {stated.applyTo(face->range.least),
                                 stated.applyTo(face->range.most)};
    entries.push_back({source, font.faceIndex, std::move(names), stated, range, face->isVariable});
    return true;
}

std::optional<FS_FoundName> FS_ExtraFontList::find(const UnicodeString& name,
                                                   const FS_FaceStyle& wanted) const {
    const std::vector<const Entry*> named = findNamed(name);
    if (named.empty()) {
        return std::nullopt;
    }
    std::vector<FS_StyleRange> ranges;
    std::ranges::transform(named, std::back_inserter(ranges),
                           [](const Entry* entry) { return entry->range; });
    const Entry& chosen = *named[chooseFont(ranges, wanted)];
    FS_FoundName found;
    found.request = {chosen.source, chosen.faceIndex, std::nullopt};
    if (chosen.variable) {
        found.request.axes = chosen.stated.applyTo(wanted);
    }
    found.familyName = chosen.names.front();
    found.tellsWidth = isOneOfManyWidths(chosen);
    found.stated = chosen.stated;
    return found;
}

// The one added last comes first.
std::vector<const FS_ExtraFontList::Entry*>
FS_ExtraFontList::findNamed(const UnicodeString& name) const {
    std::vector<const Entry*> named;
    for (const auto& isSame : {isExact, isSameFolded}) {
        for (auto entry = entries.rbegin(); entry != entries.rend() && !name.isEmpty(); ++entry) {
            const auto fits = [&](const UnicodeString& own) { return isSame(own, name); };
            if (std::ranges::any_of(entry->names, fits)) {
                named.push_back(&*entry);
            }
        }
        if (!named.empty()) {
            break;
        }
    }
    return named;
}

// A name, a weight and a slant then say too little.
bool FS_ExtraFontList::isOneOfManyWidths(const Entry& entry) const {
    if (entry.range.least.widthClass != entry.range.most.widthClass) {
        return true;
    }
    return std::ranges::any_of(entries, [&entry](const Entry& other) {
        return other.names.front() == entry.names.front() &&
               !haveSameWidths(other.range, entry.range);
    });
}

} // namespace MoxFontService_NS
