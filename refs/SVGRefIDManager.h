/// Makes the ids by which parts of a document refer to each other.
#pragma once

#include "foundation/common/MoxString.h"

#include <cstdint>
#include <map>

namespace DrawmereNS {

/// Numbers the ids of one document: a letter for the kind and a number that starts at 0 for each
/// kind, "g0", "g1" and so on.
class SVGRefIDManager {
public:
    /// What an id stands for.
    enum SVGRefType : std::int32_t {
        REFPAGE = 0,     ///< "p", the anchor of a page, whose number is the page's
        REFPATTERN = 1,  ///< "t"
        REFGRADIENT = 2, ///< "g", of both kinds
        REFRESERVED = 3, ///< "m", not in use
        REFCLIP = 4,     ///< "c"
        REFIMAGE = 5,    ///< "i", embedded images and masks in one series
    };

    SVGRefIDManager();
    virtual ~SVGRefIDManager();

    /// Returns: the letter of the kind, "xxx" for an unlisted number.
    static UnicodeString getReferencePrefix(SVGRefType type);

    /// Returns: the id of the kind with this number.
    static UnicodeString getReferenceName(SVGRefType type, int number);

    /// Returns: the next id of the kind.
    UnicodeString createReferenceID(SVGRefType type);

    /// Returns: the number behind the prefix of `id`, 0 when none is there. Of the prefix the
    /// length counts alone, not what it says.
    static int getReferenceNumber(SVGRefType type, const UnicodeString& id);

    std::map<SVGRefType, int> nextNumbers; ///< of each kind
};

} // namespace DrawmereNS
