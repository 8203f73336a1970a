#include "tests/support/TinyFont.h"

#include <algorithm>
#include <utility>

namespace DrawmereTest {
namespace {

std::string word(int value) { return {static_cast<char>(value >> 8), static_cast<char>(value)}; }

std::string dword(std::int64_t value) {
    return word(static_cast<int>(value >> 16 & 0xFFFF)) + word(static_cast<int>(value & 0xFFFF));
}

std::string words(const std::vector<int>& values) {
    std::string bytes;
    for (const int value : values) {
        bytes += word(value);
    }
    return bytes;
}

void pad(std::string& bytes) { bytes.resize((bytes.size() + 3) / 4 * 4, '\0'); }

std::string utf16(const std::string& ascii) {
    std::string bytes;
    for (const char one : ascii) {
        bytes += {'\0', one};
    }
    return bytes;
}

int fixed14(double value) { return static_cast<int>(value * 0x4000); }

// Numbers of the table of names.
constexpr int familyId = 1;
constexpr int styleId = 2;
constexpr int fullNameId = 4;
constexpr int postScriptId = 6;
constexpr int typographicFamilyId = 16;

// Numbers of languages.
constexpr int german = 0x407;
constexpr int english = 0x409;

} // namespace

TinyFont::TinyFont(std::string familyName) : family(std::move(familyName)) { addGlyph({}, 400); }

int TinyFont::addGlyph(const std::vector<TinyContour>& contours, int advance) {
    std::string flags;
    std::string xs;
    std::string ys;
    std::vector<int> ends;
    TinyPoint last;
    for (const TinyContour& contour : contours) {
        for (const TinyPoint& point : contour) {
            flags += point.onCurve ? '\1' : '\0';
            xs += word(point.x - last.x);
            ys += word(point.y - last.y);
            last = point;
        }
        ends.push_back(static_cast<int>(flags.size()) - 1);
    }
    std::string bytes;
    if (!contours.empty()) {
        bytes = words({static_cast<int>(contours.size()), 0, 0, 1000, 1000}) + words(ends) +
                word(0) + flags + xs + ys;
        pad(bytes);
    }
    glyphs.push_back({bytes, static_cast<int>(flags.size()), advance});
    return static_cast<int>(glyphs.size()) - 1;
}

int TinyFont::addComposite(const std::vector<int>& parts, int advance) {
    constexpr int wordArguments = 0x0003;
    constexpr int more = 0x0020;
    std::string bytes = words({-1, 0, 0, 1000, 1000});
    for (std::size_t i = 0; i < parts.size(); ++i) {
        const int flags = wordArguments | (i + 1 < parts.size() ? more : 0);
        bytes += words({flags, parts[i], static_cast<int>(i) * 100, 0}); // each further right
    }
    pad(bytes);
    glyphs.push_back({bytes, static_cast<int>(parts.size()), advance});
    return static_cast<int>(glyphs.size()) - 1;
}

std::string TinyFont::build() const { return assemble(buildTables(), 0); }

std::string TinyFont::buildCollection(const std::vector<TinyFont>& fonts) {
    const std::size_t headSize = 12 + 4 * fonts.size();
    std::string head = "ttcf" + dword(0x10000) + dword(static_cast<std::int64_t>(fonts.size()));
    std::string body;
    for (const TinyFont& font : fonts) {
        const std::size_t offset = headSize + body.size();
        head += dword(static_cast<std::int64_t>(offset));
        body += assemble(font.buildTables(), offset);
    }
    return head + body;
}

TinyFont::Tables TinyFont::buildTables() const {
    Tables tables;
    tables["head"] = buildHead();
    tables["hhea"] = buildLineHeader(static_cast<int>(glyphs.size()));
    tables["maxp"] = buildOutlineLimits();
    tables["cmap"] = buildCharMap();
    tables["name"] = buildNames();
    tables["OS/2"] = buildStyle();
    tables["post"] = dword(0x30000) + std::string(28, '\0');
    appendGlyphs(tables);
    if (!heights.empty()) {
        tables["vhea"] = buildLineHeader(static_cast<int>(heights.size()));
        for (const int height : heights) {
            tables["vmtx"] += words({height, 0});
        }
    }
    if (!axes.empty()) {
        tables["fvar"] = buildAxes();
        tables["gvar"] = buildVariations();
    }
    return tables;
}

std::string TinyFont::buildHead() const {
    return dword(0x10000) + dword(0x10000) + dword(0) + dword(0x5F0F3CF5) + words({0, unitsPerEm}) +
           std::string(16, '\0') +
           words({0, 0, 1000, 1000, italic ? 2 : 0, 8, 2, /*long places*/ 1, 0});
}

std::string TinyFont::buildLineHeader(int metricCount) const {
    return dword(0x10000) + words({800, -200, 90, 1000}) + std::string(22, '\0') +
           word(metricCount);
}

std::string TinyFont::buildOutlineLimits() const {
    return dword(0x10000) + word(static_cast<int>(glyphs.size())) + std::string(26, '\0');
}

// Characters of the basic plane, one segment each.
std::string TinyFont::buildCharMap() const {
    constexpr int lastShort = 0xFFFF;
    if (!characters.empty() && characters.rbegin()->first > lastShort) {
        return buildLongCharMap();
    }
    std::vector<int> ends;
    std::vector<int> deltas;
    for (const auto& [character, glyph] : characters) {
        ends.push_back(character);
        deltas.push_back(glyph - character);
    }
    ends.push_back(lastShort);
    deltas.push_back(1);
    const int count = static_cast<int>(ends.size());
    std::string segments = words({4, 16 + 8 * count, 0, 2 * count, 0, 0, 0}) + words(ends) +
                           word(0) + words(ends) + words(deltas) +
                           std::string(2 * static_cast<std::size_t>(count), '\0');
    return words({0, 1, 3, symbolic ? 0 : 1}) + dword(12) + segments;
}

std::string TinyFont::buildLongCharMap() const {
    std::string groups;
    for (const auto& [character, glyph] : characters) {
        groups += dword(character) + dword(character) + dword(glyph);
    }
    const auto count = static_cast<std::int64_t>(characters.size());
    return words({0, 1, 3, 10}) + dword(12) + words({12, 0}) + dword(16 + 12 * count) + dword(0) +
           dword(count) + groups;
}

std::string TinyFont::buildNames() const {
    struct Name {
        int language;
        int id;
        std::string text;
    };

    const Name names[] = {
        {german, familyId, foreignFamily},
        {english, familyId, family},
        {english, styleId, style},
        {english, fullNameId, style == "Regular" ? family : family + " " + style},
        {english, postScriptId, postScriptName},
        {english, typographicFamilyId, typographicFamily},
    };
    std::string records;
    std::string texts;
    int count = 0;
    for (const Name& name : names) {
        if (!name.text.empty()) {
            records += words({3, 1, name.language, name.id, static_cast<int>(2 * name.text.size()),
                              static_cast<int>(texts.size())});
            texts += utf16(name.text);
            ++count;
        }
    }
    return words({0, count, 6 + 12 * count}) + records + texts;
}

std::string TinyFont::buildStyle() const {
    const int selection = (italic ? 1 : 0) | (weight == 700 ? 0x20 : 0);
    return words({4, 520, weight, widthClass, 0}) + std::string(22 + 10 + 16, '\0') +
           dword(0x20202020) + words({selection, 0x20, 0xFFFF}) + words({800, -200, 90, 800, 200}) +
           dword(1) + dword(0) + words({450, 650, 0, 32, 0});
}

std::string TinyFont::buildAxes() const {
    const int count = static_cast<int>(axes.size());
    std::string bytes = words({1, 0, 16, 2, count, 20, 0, 4 * count + 4});
    for (const TinyAxis& axis : axes) {
        const int usual = axis.fromMost ? axis.most : axis.least;
        bytes += std::string(axis.tag.begin(), axis.tag.end()) + dword(axis.least * 65536LL) +
                 dword(usual * 65536LL) + dword(axis.most * 65536LL) + words({0, 2});
    }
    return bytes;
}

std::string TinyFont::buildVariations() const {
    const int axisCount = static_cast<int>(axes.size());
    const int glyphCount = static_cast<int>(glyphs.size());
    std::string offsets = dword(0);
    std::string bodies;
    for (const Glyph& glyph : glyphs) {
        std::string headers;
        std::string deltas;
        for (int i = 0; i < axisCount && glyph.pointCount > 0; ++i) {
            std::string data(1, '\0'); // all points
            for (int point = 0; point < glyph.pointCount; ++point) {
                data += '\x40';
                data += word(100 * (i + 1));
            }
            data += '\x83';                                               // four that stay
            data += static_cast<char>(0x80 | (glyph.pointCount + 4 - 1)); // no change upwards
            headers += words({static_cast<int>(data.size()), 0xA000});
            for (int k = 0; k < axisCount; ++k) {
                headers += word(k == i ? fixed14(axes[i].fromMost ? -1 : 1) : 0);
            }
            deltas += data;
        }
        if (!headers.empty()) {
            bodies += words({axisCount, static_cast<int>(headers.size()) + 4});
            bodies += headers + deltas;
            pad(bodies);
        }
        offsets += dword(static_cast<std::int64_t>(bodies.size()));
    }
    const int start = 20 + static_cast<int>(offsets.size());
    return words({1, 0, axisCount, 0}) + dword(start) + words({glyphCount, 1}) + dword(start) +
           offsets + bodies;
}

void TinyFont::appendGlyphs(Tables& tables) const {
    std::string& outlines = tables["glyf"];
    std::string& places = tables["loca"];
    for (const Glyph& glyph : glyphs) {
        places += dword(static_cast<std::int64_t>(outlines.size()));
        outlines += glyph.bytes;
        tables["hmtx"] += words({glyph.advance, 0});
    }
    places += dword(static_cast<std::int64_t>(outlines.size()));
    outlines.resize(std::max<std::size_t>(outlines.size(), 4));
}

std::string TinyFont::assemble(const Tables& tables, std::size_t offset) {
    std::string head = dword(0x10000) + words({static_cast<int>(tables.size()), 0, 0, 0});
    std::string body;
    const std::size_t start = offset + head.size() + 16 * tables.size();
    for (const auto& [tag, bytes] : tables) {
        head += tag + dword(0) + dword(static_cast<std::int64_t>(start + body.size())) +
                dword(static_cast<std::int64_t>(bytes.size()));
        body += bytes;
        pad(body);
    }
    return head + body;
}

namespace {

// The cipher of Type 1 fonts.
std::string encrypt(const std::string& plain, unsigned key) {
    std::string cipher;
    for (const char one : plain) {
        const auto byte = static_cast<unsigned char>(static_cast<unsigned char>(one) ^ (key >> 8U));
        key = ((byte + key) * 52845U + 22719U) & 0xFFFFU;
        cipher += static_cast<char>(byte);
    }
    return cipher;
}

std::string toHex(const std::string& bytes) {
    constexpr char digits[] = "0123456789abcdef";
    std::string text;
    for (const char one : bytes) {
        const auto byte = static_cast<unsigned char>(one);
        text += {digits[byte >> 4U], digits[byte & 15U]};
    }
    return text;
}

// Numbers of the outline language of Type 1 fonts; below -999 it means the command of that rank.
constexpr int command = -1000;

std::string charString(const std::vector<int>& tokens) {
    std::string bytes = "0000"; // four that count for nothing
    for (const int token : tokens) {
        if (token <= command) {
            bytes += static_cast<char>(command - token);
        } else {
            bytes += '\xFF' + dword(token);
        }
    }
    return encrypt(bytes, 4330);
}

std::string charStringEntry(const std::string& name, const std::vector<int>& tokens) {
    const std::string bytes = charString(tokens);
    return "/" + name + " " + std::to_string(bytes.size()) + " RD " + bytes + " ND\n";
}

} // namespace

std::string buildTypeOne() {
    constexpr int line = command - 5;
    constexpr int curve = command - 8;
    constexpr int close = command - 9;
    constexpr int sides = command - 13;
    constexpr int end = command - 14;
    constexpr int move = command - 21;
    const std::string hidden =
        "0000dup /Private 8 dict dup begin\n"
        "/RD {string currentfile exch readstring pop} executeonly def\n"
        "/ND {noaccess def} executeonly def\n/NP {noaccess put} executeonly def\n"
        "/BlueValues [] def\n/password 5839 def\n"
        "2 index /CharStrings 3 dict dup begin\n" +
        charStringEntry(".notdef", {0, 300, sides, end}) +
        charStringEntry("A",
                        {0, 600, sides, 0, 0, move, 500, 0, line, -250, 700, line, close, end}) +
        charStringEntry("B",
                        {0, 650, sides, 0, 0, move, 0, 100, 200, 300, 400, 0, curve, close, end}) +
        "end\nend\nreadonly put\nnoaccess put\ndup/FontName get exch definefont pop\n"
        "mark currentfile closefile\n";
    return "%!PS-AdobeFont-1.0: TinyTypeOne 001.000\n11 dict begin\n"
           "/FontInfo 3 dict dup begin\n/FullName (Tiny Type One) readonly def\n"
           "/FamilyName (Tiny Type One) readonly def\n/Weight (Regular) readonly def\n"
           "end readonly def\n"
           "/FontName /TinyTypeOne def\n/PaintType 0 def\n/FontType 1 def\n"
           "/FontMatrix [0.001 0 0 0.001 0 0] readonly def\n"
           "/Encoding StandardEncoding def\n/FontBBox {0 0 1000 1000} readonly def\n"
           "currentdict end\ncurrentfile eexec\n" +
           toHex(encrypt(hidden, 55665)) + "\n" + std::string(64, '0') + "\ncleartomark\n";
}

std::string buildBitmapFont() {
    return "STARTFONT 2.1\n"
           "FONT -Tiny-Tiny Bitmap-Medium-R-Normal--8-80-75-75-C-80-ISO10646-1\n"
           "SIZE 8 75 75\nFONTBOUNDINGBOX 8 8 0 0\n"
           "STARTPROPERTIES 5\nFAMILY_NAME \"Tiny Bitmap\"\nFONT_ASCENT 8\nFONT_DESCENT 0\n"
           "CHARSET_REGISTRY \"ISO10646\"\nCHARSET_ENCODING \"1\"\nENDPROPERTIES\n"
           "CHARS 1\nSTARTCHAR A\nENCODING 65\nSWIDTH 1000 0\nDWIDTH 8 0\nBBX 8 8 0 0\nBITMAP\n"
           "18\n24\n42\n42\n7E\n42\n42\n00\nENDCHAR\nENDFONT\n";
}

} // namespace DrawmereTest
