#include "foundation/common/MoxTokenizer.h"

#include "foundation/common/MoxAsciiChars.h"
#include "foundation/common/MoxParser.h"

namespace MoxCommonNS {
namespace {

bool isSeparator(char16_t c) { return isXmlSpace(c) || c == u','; }

} // namespace

MoxTokenizer::MoxTokenizer(const UnicodeString& text, TokenizerType type)
    : content(text), tokenType(type) {}

MoxValue MoxTokenizer::nextTokenValue(bool parsed) {
    const UnicodeString token = nextToken();
    return parsed ? MoxParser::parse(token, 0, tokenType) : MoxValue(token);
}

UnicodeString MoxTokenizer::nextToken() {
    while (position < content.length() && isSeparator(content[position])) {
        ++position;
    }
    const std::int32_t start = position;
    while (position < content.length() && !isSeparator(content[position])) {
        ++position;
    }
    return {content, start, position - start};
}

} // namespace MoxCommonNS
