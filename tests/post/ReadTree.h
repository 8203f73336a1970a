/// Trees for tests, written as the XML that they are saved as.
#pragma once

#include "tests/support/SvgPage.h"
#include "tests/support/XmlReader.h"
#include "tree/SVGDocument.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

namespace DrawmereTest {

using namespace DrawmereNS;

inline const std::string xmlDeclaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

inline MoxName toName(const std::string& text) { return MoxName(UnicodeString::fromUTF8(text)); }

/// Returns: the document of an element written as XML; names with a colon stay in one piece.
inline MoxPtr<SVGDocument> readTree(const std::string& xml) {
    const XmlReading reading = readXml(xmlDeclaration + xml);
    EXPECT_EQ(reading.error, "") << xml;
    MoxPtr<SVGDocument> document(new SVGDocument);
    MoxNode* parent = document.get();
    for (const XmlEvent& event : reading.events) {
        if (event.kind == XmlEvent::END) {
            parent = parent->getParentNode();
        } else if (event.kind == XmlEvent::TEXT) {
            parent->appendChildText(UnicodeString::fromUTF8(event.text));
        } else {
            const MoxPtr<MoxElement> element = document->createElement(toName(event.name));
            for (const auto& [name, value] : event.attributes) {
                element->setAttribute(toName(name), MoxValue(UnicodeString::fromUTF8(value)));
            }
            parent = parent->appendChild(element.get());
        }
    }
    return document;
}

/// Returns: the document as it is saved, without the declaration.
inline std::string writeTree(const MoxDocument& document) {
    std::ostringstream stream;
    document.save(UnicodeString(), UnicodeString(), stream, nullptr, UnicodeString(),
                  UnicodeString());
    std::string text = stream.str();
    text.erase(0, text.find('\n') + 1);
    while (text.ends_with('\n')) {
        text.pop_back();
    }
    return text;
}

} // namespace DrawmereTest
