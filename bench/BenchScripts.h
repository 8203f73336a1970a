/// Real texts of four scripts, shaped.
#pragma once

#include "foundation/common/MoxString.h"
#include "foundation/records/TLStringWithGlyphInfo.h"

#include <array>
#include <cstddef>
#include <string>
#include <vector>

namespace DrawmereNS {

/// A run of text in one script, with the glyphs that HarfBuzz makes of it.
struct BenchRun {
    std::size_t script;
    UnicodeString text;
    TalFont::TLStringWithGlyphInfo glyphs;
    bool leftToRight;
};

/// A script and a font of it.
struct BenchScript {
    const char16_t* fontName;
    bool leftToRight;
    const char16_t* text; ///< sentences
};

constexpr std::size_t benchScriptCount = 4;

/// Latin, Arabic, Devanagari and Japanese.
extern const std::array<BenchScript, benchScriptCount> benchScripts;

/// Returns: runs of about `runLength` characters, `charCount` characters in all, the scripts in
/// turn after each paragraph; the Japanese ones have as many different characters as a book.
std::vector<BenchRun> makeBenchRuns(std::size_t charCount, std::size_t runLength);

/// Returns: the file of the font, and the index of its face. Throws: std::runtime_error.
struct BenchFontFile {
    std::string path;
    long face;
};

BenchFontFile findBenchFont(const char16_t* name);

} // namespace DrawmereNS
