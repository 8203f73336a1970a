#include "refs/SVGRefIDManager.h"

#include "foundation/common/MoxParser.h"
#include "foundation/common/MoxUtil.h"
#include "foundation/common/MoxWord.h"

namespace DrawmereNS {

using MoxCommonNS::MoxParser;
using MoxCommonNS::MoxTokenizer;
using MoxCommonNS::MoxUtil;
using MoxCommonNS::MoxWord;

namespace {

constexpr MoxWord<SVGRefIDManager::SVGRefType> prefixes[] = {
    {SVGRefIDManager::REFPAGE, u"p"},     {SVGRefIDManager::REFPATTERN, u"t"},
    {SVGRefIDManager::REFGRADIENT, u"g"}, {SVGRefIDManager::REFRESERVED, u"m"},
    {SVGRefIDManager::REFCLIP, u"c"},     {SVGRefIDManager::REFIMAGE, u"i"},
};

constexpr char16_t unlistedPrefix[] = u"xxx";

} // namespace

SVGRefIDManager::SVGRefIDManager() {
    for (const MoxWord<SVGRefType>& row : prefixes) {
        nextNumbers[row.key] = 0;
    }
}

SVGRefIDManager::~SVGRefIDManager() = default;

UnicodeString SVGRefIDManager::getReferencePrefix(SVGRefType type) {
    const char16_t* prefix = findWord(prefixes, type);
    return UnicodeString(prefix ? prefix : unlistedPrefix);
}

UnicodeString SVGRefIDManager::getReferenceName(SVGRefType type, int number) {
    return getReferencePrefix(type) + MoxUtil::toString(number);
}

UnicodeString SVGRefIDManager::createReferenceID(SVGRefType type) {
    return getReferenceName(type, nextNumbers[type]++);
}

int SVGRefIDManager::getReferenceNumber(SVGRefType type, const UnicodeString& id) {
    const UnicodeString number(id, getReferencePrefix(type).length());
    return MoxParser::parse(number, 0, MoxTokenizer::TOKENIZER_DEFAULT).getIntegerValue();
}

} // namespace DrawmereNS
