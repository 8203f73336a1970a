#include "foundation/fontservice/FS_FontConfig.h"

#include <algorithm>
#include <memory>
#include <new>
#include <strings.h>
#include <tuple>
#include <utility>

namespace MoxFontService_NS {

namespace {

template <auto release> struct Releaser {
    template <typename T> void operator()(T* object) const { release(object); }
};

using PatternPtr = std::unique_ptr<FcPattern, Releaser<FcPatternDestroy>>;
using FontSetPtr = std::unique_ptr<FcFontSet, Releaser<FcFontSetDestroy>>;
using ObjectSetPtr = std::unique_ptr<FcObjectSet, Releaser<FcObjectSetDestroy>>;

// The generic families of CSS, which mean some font wherever there is one.
constexpr const char* genericFamilies[] = {
    "serif",         "sans-serif",   "monospace",  "cursive", "fantasy", "system-ui", "ui-serif",
    "ui-sans-serif", "ui-monospace", "ui-rounded", "math",    "emoji",   "fangsong",
};

// A name that no font has and no configuration declares. What substitution makes of it, it makes
// of every unknown name.
constexpr const char* unknownFamily = "\x01 no family";

// How fontconfig numbers faces: above these bits an instance of a variable font, where the topmost
// one stands for the font with its axes free.
constexpr int faceBits = 16;
constexpr int instanceMask = 0x7FFF;

struct Candidate {
    std::string file;
    int index = 0;
    FS_StyleRange range;
    bool variable = false;
    bool scalable = true;
    int version = 0;
    std::string fullName;
};

const FcChar8* toFc(const std::string& text) {
    return reinterpret_cast<const FcChar8*>(text.c_str());
}

std::string fromFc(const FcChar8* text) { return reinterpret_cast<const char*>(text); }

bool isSameName(const std::string& a, const std::string& b) {
    return FcStrCmpIgnoreCase(toFc(a), toFc(b)) == 0;
}

std::string getText(const FcPattern* pattern, const char* property) {
    FcChar8* text = nullptr;
    const bool there = FcPatternGetString(pattern, property, 0, &text) == FcResultMatch;
    return there ? fromFc(text) : std::string();
}

int getNumber(const FcPattern* pattern, const char* property, int otherwise) {
    int number = otherwise;
    return FcPatternGetInteger(pattern, property, 0, &number) == FcResultMatch ? number : otherwise;
}

bool getFlag(const FcPattern* pattern, const char* property) {
    FcBool flag = FcFalse;
    return FcPatternGetBool(pattern, property, 0, &flag) == FcResultMatch && flag == FcTrue;
}

// A property of a variable font is a range, of any other a number.
std::pair<double, double> getRange(const FcPattern* pattern, const char* property,
                                   double otherwise) {
    double number = otherwise;
    FcRange* range = nullptr; // borrowed
    double least = otherwise;
    double most = otherwise;
    if (FcPatternGetDouble(pattern, property, 0, &number) == FcResultMatch) {
        return {number, number};
    }
    if (FcPatternGetRange(pattern, property, 0, &range) == FcResultMatch &&
        FcRangeGetDouble(range, &least, &most)) {
        return {least, most};
    }
    return {otherwise, otherwise};
}

FS_StyleRange getStyles(const FcPattern* pattern) {
    const auto weights = getRange(pattern, FC_WEIGHT, FC_WEIGHT_REGULAR);
    const auto widths = getRange(pattern, FC_WIDTH, FC_WIDTH_NORMAL);
    const auto slants = getRange(pattern, FC_SLANT, FC_SLANT_ROMAN);
    FS_StyleRange range;
    range.least.weight = static_cast<int>(FcWeightToOpenTypeDouble(weights.first));
    range.most.weight = static_cast<int>(FcWeightToOpenTypeDouble(weights.second));
    range.least.widthClass = widthClassOf(widths.first);
    range.most.widthClass = widthClassOf(widths.second);
    range.least.italic = slants.first > FC_SLANT_ROMAN;
    range.most.italic = slants.second > FC_SLANT_ROMAN;
    return range;
}

Candidate readCandidate(const FcPattern* pattern) {
    Candidate font;
    font.file = getText(pattern, FC_FILE);
    font.index = getNumber(pattern, FC_INDEX, 0);
    font.range = getStyles(pattern);
    font.variable = getFlag(pattern, FC_VARIABLE);
    font.scalable = getFlag(pattern, FC_OUTLINE);
    font.version = getNumber(pattern, FC_FONTVERSION, 0);
    font.fullName = getText(pattern, FC_FULLNAME);
    return font;
}

int instanceOf(const Candidate& font) {
    return font.variable ? 0 : (font.index >> faceBits) & instanceMask;
}

// Among equal styles outlines go before bitmaps, free axes before set ones and new before old; the
// rest makes the order certain.
bool goesBefore(const Candidate& a, const Candidate& b) {
    return std::tuple(!a.scalable, !a.variable, -a.version, a.file, a.index) <
           std::tuple(!b.scalable, !b.variable, -b.version, b.file, b.index);
}

FS_FoundName makeFound(const Candidate& font, const FS_FaceStyle& wanted) {
    FS_FoundName found;
    found.request.source.path = font.file;
    found.request.faceIndex = (font.index & ((1 << faceBits) - 1)) | instanceOf(font) << faceBits;
    if (font.variable) {
        found.request.axes = wanted;
    }
    if (instanceOf(font) != 0) {
        found.familyName = UnicodeString::fromUTF8(font.fullName);
    }
    return found;
}

// fontconfig has no other reason to fail where this is asked.
void requireMemory(bool isThere) {
    if (!isThere) {
        throw std::bad_alloc();
    }
}

PatternPtr makePattern() {
    PatternPtr pattern(FcPatternCreate());
    requireMemory(pattern != nullptr);
    return pattern;
}

void add(FcPattern& pattern, const char* property, const std::string& text) {
    requireMemory(FcPatternAddString(&pattern, property, toFc(text)) != FcFalse);
}

std::vector<Candidate> listFonts(FcConfig* config, const char* property, const std::string& name) {
    const PatternPtr pattern = makePattern();
    add(*pattern, property, name);
    const ObjectSetPtr wanted(FcObjectSetBuild(FC_FILE, FC_INDEX, FC_WEIGHT, FC_SLANT, FC_WIDTH,
                                               FC_VARIABLE, FC_OUTLINE, FC_FONTVERSION, FC_FULLNAME,
                                               nullptr));
    requireMemory(wanted != nullptr);
    const FontSetPtr listed(FcFontList(config, pattern.get(), wanted.get()));
    std::vector<Candidate> fonts;
    requireMemory(listed != nullptr);
    for (int i = 0; i < listed->nfont; ++i) {
        fonts.push_back(readCandidate(listed->fonts[i]));
    }
    return fonts;
}

bool isGeneric(const std::string& name) {
    return std::ranges::any_of(genericFamilies,
                               [&name](const char* word) { return isSameName(name, word); });
}

// Takes one occurrence of each of `taken` from `families`.
void takeAway(std::vector<std::string>& families, const std::vector<std::string>& taken) {
    for (const std::string& one : taken) {
        const auto same = std::ranges::find_if(
            families, [&one](const std::string& family) { return isSameName(family, one); });
        if (same != families.end()) {
            families.erase(same);
        }
    }
}

} // namespace

// A configuration that can't be read is replaced by one that knows no fonts.
FS_FontConfig::FS_FontConfig() : config(FcInitLoadConfigAndFonts()) {
    requireMemory(config != nullptr);
}

FS_FontConfig::~FS_FontConfig() { FcConfigDestroy(config); }

std::optional<FS_FoundName> FS_FontConfig::find(const std::string& name,
                                                const FS_FaceStyle& wanted) const {
    if (name.empty()) {
        return std::nullopt;
    }
    for (const char* property : {FC_FAMILY, FC_FULLNAME, FC_POSTSCRIPT_NAME}) {
        if (auto found = findListed(property, name, wanted)) {
            return found;
        }
    }
    return isGeneric(name) ? findGeneric(name, wanted) : findAlias(name, wanted);
}

bool FS_FontConfig::isUpToDate() const { return FcConfigUptoDate(config) == FcTrue; }

std::chrono::seconds FS_FontConfig::getRescanInterval() const {
    constexpr std::chrono::hours never{24 * 365};
    const int seconds = FcConfigGetRescanInterval(config);
    return seconds > 0 ? std::chrono::seconds(seconds) : never;
}

// An instance of a variable font is taken by its own name alone: whoever names the family gets the
// font with its axes free.
std::optional<FS_FoundName> FS_FontConfig::findListed(const char* property, const std::string& name,
                                                      const FS_FaceStyle& wanted) const {
    std::vector<Candidate> fonts = listFonts(config, property, name);
    if (std::string_view(property) == FC_FAMILY) {
        std::erase_if(fonts, [](const Candidate& font) { return instanceOf(font) != 0; });
    }
    if (fonts.empty()) {
        return std::nullopt;
    }
    std::ranges::sort(fonts, goesBefore);
    std::vector<FS_StyleRange> ranges;
    std::ranges::transform(fonts, std::back_inserter(ranges), &Candidate::range);
    return makeFound(fonts[chooseFont(ranges, wanted)], wanted);
}

std::optional<FS_FoundName> FS_FontConfig::findAlias(const std::string& name,
                                                     const FS_FaceStyle& wanted) const {
    const Families declared = findDeclared(name);
    for (const std::string& family : substitute({name})) {
        const auto isSame = [&family](const std::string& one) { return isSameName(one, family); };
        if (std::ranges::none_of(declared, isSame)) {
            continue;
        }
        if (auto found = findListed(FC_FAMILY, family, wanted)) {
            return found;
        }
    }
    return std::nullopt;
}

// Whatever fontconfig takes for a generic family is right.
std::optional<FS_FoundName> FS_FontConfig::findGeneric(const std::string& name,
                                                       const FS_FaceStyle& wanted) const {
    const PatternPtr pattern = makePattern();
    add(*pattern, FC_FAMILY, name);
    requireMemory(FcConfigSubstitute(config, pattern.get(), FcMatchPattern) != FcFalse);
    FcDefaultSubstitute(pattern.get());
    FcResult result = FcResultNoMatch;
    const PatternPtr match(FcFontMatch(config, pattern.get(), &result));
    if (!match) {
        return std::nullopt;
    }
    return findListed(FC_FAMILY, getText(match.get(), FC_FAMILY), wanted);
}

FS_FontConfig::Families FS_FontConfig::substitute(const Families& families) const {
    const PatternPtr pattern = makePattern();
    for (const std::string& family : families) {
        add(*pattern, FC_FAMILY, family);
    }
    requireMemory(FcConfigSubstitute(config, pattern.get(), FcMatchPattern) != FcFalse);
    Families made;
    FcChar8* family = nullptr;
    while (FcPatternGetString(pattern.get(), FC_FAMILY, static_cast<int>(made.size()), &family) ==
           FcResultMatch) {
        made.push_back(fromFc(family));
    }
    return made;
}

// The families that substitution adds for this name and not for an unknown one. Each name is asked
// for together with a generic family, once with one and once with the other: a configuration gives
// every name without a generic family sans-serif, and would hide that it also declares it for this.
FS_FontConfig::Families FS_FontConfig::findDeclared(const std::string& name) const {
    Families declared;
    for (const char* generic : {"monospace", "serif"}) {
        Families families = substitute({name, generic});
        takeAway(families, substitute({unknownFamily, generic}));
        declared.insert(declared.end(), families.begin(), families.end());
    }
    std::erase_if(declared, [&name](const std::string& one) { return isSameName(one, name); });
    return declared;
}

} // namespace MoxFontService_NS
