/// What a reader of XML should find where a tree was written.
#pragma once

#include "foundation/common/MoxDocument.h"
#include "tests/support/XmlReader.h"

#include <vector>

namespace DrawmereTest {

/// Returns: `text` in UTF-8 as a document can hold it, with U+FFFD for what it can't.
std::string toXmlText(const icu::UnicodeString& text);

/// Returns: the tags and texts of `document`, with its values as they are written without rounding.
std::vector<XmlEvent> readTree(const MoxCommonNS::MoxDocument& document);

/// Returns: the first difference between what was to be written and what was read, empty when
/// there is none. The texts of neighbours count as one.
std::string findDifference(const std::vector<XmlEvent>& tree, const std::vector<XmlEvent>& read);

} // namespace DrawmereTest
