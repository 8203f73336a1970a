/// What a document refers to, and what it has.
#pragma once

#include "foundation/common/MoxString.h"
#include "tests/support/XmlReader.h"

#include <set>
#include <string>
#include <vector>

namespace DrawmereTest {

using icu::UnicodeString;

/// The ids of a document, and the references to ids within it.
class References {
public:
    /// Small-device mode turns what is drawn into the data of its image and leaves definitions
    /// alone, so that what a definition uses need not be there.
    References(const XmlReading& reading, bool isSmallDevice);

    /// Returns: the first reference that leads nowhere, empty when there is none. References in the
    /// caller's own words are the caller's business, and those to a definition that was not
    /// written, because it was begun where none can be, are lost with it. A "#" leads nowhere by
    /// itself: so does a link to no name.
    std::string findFault(const std::vector<UnicodeString>& words,
                          const std::vector<UnicodeString>& lost) const;

private:
    void readElement(const XmlEvent& event, bool isLeftAlone);

    std::set<std::string> ids;
    std::set<std::string> references; // without "#"
};

} // namespace DrawmereTest
