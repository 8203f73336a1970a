#include "foundation/common/MoxXmlChars.h"

#include <algorithm>
#include <iterator>

namespace MoxCommonNS {
namespace {

struct CharRange {
    UChar32 first;
    UChar32 last;
};

constexpr CharRange nameStartRanges[] = {
    {':', ':'},       {'A', 'Z'},       {'_', '_'},       {'a', 'z'},
    {0xC0, 0xD6},     {0xD8, 0xF6},     {0xF8, 0x2FF},    {0x370, 0x37D},
    {0x37F, 0x1FFF},  {0x200C, 0x200D}, {0x2070, 0x218F}, {0x2C00, 0x2FEF},
    {0x3001, 0xD7FF}, {0xF900, 0xFDCF}, {0xFDF0, 0xFFFD}, {0x10000, 0xEFFFF},
};

constexpr CharRange furtherNameRanges[] = {
    {'-', '.'}, {'0', '9'}, {0xB7, 0xB7}, {0x300, 0x36F}, {0x203F, 0x2040},
};

template <typename Ranges> bool isInside(const Ranges& ranges, UChar32 codePoint) {
    return std::any_of(std::begin(ranges), std::end(ranges), [codePoint](const CharRange& range) {
        return codePoint >= range.first && codePoint <= range.last;
    });
}

} // namespace

bool isXmlNameStart(UChar32 codePoint) { return isInside(nameStartRanges, codePoint); }

bool isXmlNameChar(UChar32 codePoint) {
    return isXmlNameStart(codePoint) || isInside(furtherNameRanges, codePoint);
}

} // namespace MoxCommonNS
