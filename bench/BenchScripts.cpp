#include "bench/BenchScripts.h"

#include <algorithm>
#include <cmath>
#include <memory>
#include <random>
#include <stdexcept>

#include <fontconfig/fontconfig.h>
#include <hb-ot.h>
#include <unicode/utf16.h>

namespace DrawmereNS {

// The first articles of the Universal Declaration of Human Rights.
const std::array<BenchScript, benchScriptCount> benchScripts = {{
    {u"Noto Serif", true,
     u"All human beings are born free and equal in dignity and rights. They are endowed with reason "
     u"and conscience and should act towards one another in a spirit of brotherhood. Everyone is "
     u"entitled to all the rights and freedoms set forth in this Declaration, without distinction "
     u"of any kind, such as race, colour, sex, language, religion, political or other opinion, "
     u"national or social origin, property, birth or other status. No one shall be held in slavery "
     u"or servitude; slavery and the slave trade shall be prohibited in all their forms. No one "
     u"shall be subjected to arbitrary arrest, detention or exile (article 9, of 30). "},
    {u"Noto Naskh Arabic", false,
     u"يولد جميع الناس أحرارًا متساوين في الكرامة والحقوق. وقد وهبوا عقلاً وضميرًا وعليهم أن يعامل "
     u"بعضهم بعضًا بروح الإخاء. لكل إنسان حق التمتع بكافة الحقوق والحريات الواردة في هذا الإعلان، "
     u"دون أي تمييز، كالتمييز بسبب العنصر أو اللون أو الجنس أو اللغة أو الدين أو الرأي السياسي. "
     u"لكل فرد الحق في الحياة والحرية وسلامة شخصه. لا يجوز استرقاق أو استعباد أي شخص. "},
    {u"Noto Sans Devanagari", true,
     u"सभी मनुष्यों को गौरव और अधिकारों के मामले में जन्मजात स्वतन्त्रता और समानता प्राप्त है। उन्हें बुद्धि और "
     u"अन्तरात्मा की देन प्राप्त है और परस्पर उन्हें भाईचारे के भाव से बर्ताव करना चाहिए। प्रत्येक व्यक्ति को जीवन, "
     u"स्वाधीनता और वैयक्तिक सुरक्षा का अधिकार है। कोई भी ग़ुलामी या दासता की हालत में न रखा जाएगा। "},
    {u"Noto Sans CJK JP", true,
     u"すべての人間は、生まれながらにして自由であり、かつ、尊厳と権利とについて平等である。人間は、理性と良心とを"
     u"授けられており、互いに同胞の精神をもって行動しなければならない。すべて人は、人種、皮膚の色、性、言語、宗教、"
     u"政治上その他の意見、国民的若しくは社会的出身、財産、門地その他の地位又はこれに類するいかなる事由による差別を"
     u"も受けることなく、この宣言に掲げるすべての権利と自由とを享有することができる。"},
}};

namespace {

constexpr std::size_t japanese = 3;
constexpr std::size_t paragraphLength = 400;
constexpr char16_t firstKanji = 0x4E00;

struct FontDeleter {
    void operator()(hb_font_t* font) const { hb_font_destroy(font); }
};

struct BufferDeleter {
    void operator()(hb_buffer_t* buffer) const { hb_buffer_destroy(buffer); }
};

using Font = std::unique_ptr<hb_font_t, FontDeleter>;
using Buffer = std::unique_ptr<hb_buffer_t, BufferDeleter>;

Font openFont(const char16_t* name) {
    const BenchFontFile file = findBenchFont(name);
    hb_blob_t* blob = hb_blob_create_from_file(file.path.c_str());
    hb_face_t* face = hb_face_create(blob, static_cast<unsigned>(file.face));
    Font font(hb_font_create(face));
    hb_face_destroy(face);
    hb_blob_destroy(blob);
    return font;
}

/// Entries in the order of the text: of glyphs that run leftwards, the last comes first.
TalFont::TLStringWithGlyphInfo shape(hb_font_t* font, const UnicodeString& text) {
    const Buffer buffer(hb_buffer_create());
    hb_buffer_add_utf16(buffer.get(), reinterpret_cast<const std::uint16_t*>(text.getBuffer()),
                        text.length(), 0, text.length());
    hb_buffer_guess_segment_properties(buffer.get());
    hb_shape(font, buffer.get(), nullptr, 0);
    if (HB_DIRECTION_IS_BACKWARD(hb_buffer_get_direction(buffer.get()))) {
        hb_buffer_reverse_clusters(buffer.get());
    }
    unsigned count = 0;
    const hb_glyph_info_t* infos = hb_buffer_get_glyph_infos(buffer.get(), &count);
    std::vector<TalFont::TLGlyphEntry> entries(count);
    std::size_t cluster = 0;
    for (unsigned i = 0; i < count; ++i) {
        entries[i].glyphId = static_cast<std::uint16_t>(infos[i].codepoint);
        cluster = i == 0 || infos[i].cluster != infos[i - 1].cluster ? i : cluster;
        const bool isLast = i + 1 == count || infos[i + 1].cluster != infos[i].cluster;
        if (isLast) {
            const unsigned end =
                i + 1 == count ? static_cast<unsigned>(text.length()) : infos[i + 1].cluster;
            entries[cluster].charCount = static_cast<std::int16_t>(end - infos[i].cluster);
        }
    }
    return TalFont::TLStringWithGlyphInfo(std::move(entries));
}

/// In a book every second character is a kanji, and the n-th of them in order of use comes about
/// once in n.
class KanjiSource {
public:
    char16_t next() {
        constexpr double kinds = 2500;
        const double share = static_cast<double>(random()) / std::mt19937::max();
        const auto rank = static_cast<std::uint32_t>(std::pow(kinds, share));
        return static_cast<char16_t>(firstKanji + rank * 7);
    }

private:
    std::mt19937 random{7};
};

UnicodeString makeParagraph(std::size_t script, std::size_t& offset, KanjiSource& kanji) {
    const UnicodeString source(benchScripts[script].text);
    UnicodeString text;
    while (static_cast<std::size_t>(text.length()) < paragraphLength) {
        char16_t unit = source.charAt(static_cast<std::int32_t>(offset));
        offset = (offset + 1) % static_cast<std::size_t>(source.length());
        if (script == japanese && unit >= firstKanji) {
            unit = kanji.next();
        }
        text.append(unit);
    }
    return text;
}

/// Returns: where the run ends that begins at `begin`: behind a blank, except in Japanese.
std::int32_t findRunEnd(const UnicodeString& text, std::int32_t begin, std::size_t runLength,
                        bool atBlanks) {
    const auto wanted = static_cast<std::int32_t>(
        std::min(begin + runLength, static_cast<std::size_t>(text.length())));
    const std::int32_t blank = atBlanks ? text.indexOf(u' ', wanted - 1) : wanted - 1;
    return blank < 0 ? text.length() : blank + 1;
}

} // namespace

std::vector<BenchRun> makeBenchRuns(std::size_t charCount, std::size_t runLength) {
    std::array<Font, benchScriptCount> fonts;
    std::array<std::size_t, benchScriptCount> offsets = {};
    for (std::size_t i = 0; i < benchScriptCount; ++i) {
        fonts[i] = openFont(benchScripts[i].fontName);
    }
    KanjiSource kanji;
    std::vector<BenchRun> runs;
    std::size_t done = 0;
    for (std::size_t script = 0; done < charCount; script = (script + 1) % benchScriptCount) {
        const UnicodeString paragraph = makeParagraph(script, offsets[script], kanji);
        std::int32_t begin = 0;
        while (begin < paragraph.length() && done < charCount) {
            const std::int32_t end =
                findRunEnd(paragraph, begin, runLength, /*atBlanks=*/script != japanese);
            UnicodeString text = paragraph.tempSubStringBetween(begin, end);
            runs.push_back(
                {script, text, shape(fonts[script].get(), text), benchScripts[script].leftToRight});
            done += static_cast<std::size_t>(end - begin);
            begin = end;
        }
    }
    return runs;
}

BenchFontFile findBenchFont(const char16_t* name) {
    std::string family;
    UnicodeString(name).toUTF8String(family);
    FcPattern* wanted = FcPatternCreate();
    FcPatternAddString(wanted, FC_FAMILY, reinterpret_cast<const FcChar8*>(family.c_str()));
    FcConfigSubstitute(nullptr, wanted, FcMatchPattern);
    FcDefaultSubstitute(wanted);
    FcResult result = FcResultNoMatch;
    FcPattern* found = FcFontMatch(nullptr, wanted, &result);
    FcPatternDestroy(wanted);
    FcChar8* path = nullptr;
    int face = 0;
    if (!found || FcPatternGetString(found, FC_FILE, 0, &path) != FcResultMatch) {
        throw std::runtime_error("no font " + family);
    }
    FcPatternGetInteger(found, FC_INDEX, 0, &face);
    BenchFontFile file = {reinterpret_cast<const char*>(path), face};
    FcPatternDestroy(found);
    return file;
}

} // namespace DrawmereNS
