/// Cuts a text into tokens.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxString.h"
#include "foundation/common/MoxValue.h"

#include <cstdint>

namespace MoxCommonNS {

/// Walks over the tokens of a list as SVG 1.1 writes them: whatever stands between white space of
/// XML 1.0 and commas. Several separators in a row count as one, so no token is empty.
class DRAWMERE_API MoxTokenizer {
public:
    /// How a text is cut and read. Callers may pass any number; all of them mean the default.
    enum TokenizerType : std::int32_t { TOKENIZER_DEFAULT = 0 };

    /// Keeps a copy of `text` and stands before its first token.
    explicit MoxTokenizer(const UnicodeString& text, TokenizerType type = TOKENIZER_DEFAULT);

    /// Returns: the next token, as a string, or with `parsed` as `MoxParser::parse` reads it. At
    /// the end an empty string, or with `parsed` the null value; the text of both is empty.
    MoxValue nextTokenValue(bool parsed);

private:
    UnicodeString nextToken();

    UnicodeString content;
    TokenizerType tokenType;
    std::int32_t position = 0;
};

} // namespace MoxCommonNS
