/// A strict reader of XML 1.0, for tests of what was written.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace DrawmereTest {

/// One thing that a reader of a document meets.
struct XmlEvent {
    enum Kind { START, END, TEXT };

    /// Returns: the value of an attribute, "(none)" when it is absent.
    std::string attribute(std::string_view wanted) const;

    Kind kind = TEXT;
    std::string name; ///< of a tag
    std::vector<std::pair<std::string, std::string>> attributes;
    std::string text; ///< with all references resolved
};

/// What a document says.
struct XmlReading {
    /// Returns: all texts one after the other.
    std::string text() const;

    /// Returns: the first start tag with this name, one without a name when there is none.
    XmlEvent element(std::string_view wanted) const;

    std::string error; ///< why the document is not well-formed, and where; empty when it is
    std::string encoding;
    std::string doctype; ///< what stands between "<!DOCTYPE " and ">"
    std::vector<XmlEvent> events;
};

/// Reads a document in UTF-8 that begins with an XML declaration. It knows what this library may
/// write: tags, texts, references to characters and to the five predefined entities, and a document
/// type declaration without an internal subset. Everything else is an error, and so is all that
/// XML 1.0 calls one. Values come as a reader of XML gives them, with white space normalised.
XmlReading readXml(std::string_view document);

} // namespace DrawmereTest
