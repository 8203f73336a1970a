#include "tests/fuzz/TreeReading.h"

#include "foundation/common/MoxElement.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxXmlChars.h"

#include <algorithm>

namespace DrawmereTest {
namespace {

using namespace MoxCommonNS;

std::string nameOf(MoxName name) { return toXmlText(MoxNameTable::getSharedNameString(name)); }

XmlEvent readStart(const MoxElement& element) {
    XmlEvent event{XmlEvent::START, nameOf(element.getNodeName()), {}, {}};
    for (const MoxValue& attribute : element.attributeLinks()) {
        event.attributes.emplace_back(nameOf(attribute.getKey()), toXmlText(attribute.toString()));
    }
    return event;
}

void close(std::vector<XmlEvent>& events, const MoxNode* node) {
    if (node->kindLink() == MOXNODE_ELEMENT) {
        events.push_back({XmlEvent::END, nameOf(node->getNodeName()), {}, {}});
    }
}

void addText(std::vector<XmlEvent>& events, const std::string& text) {
    if (!events.empty() && events.back().kind == XmlEvent::TEXT) {
        events.back().text += text;
    } else if (!text.empty()) {
        events.push_back({XmlEvent::TEXT, {}, {}, text});
    }
}

void open(std::vector<XmlEvent>& events, const MoxNode* node) {
    if (node->kindLink() == MOXNODE_ELEMENT) {
        events.push_back(readStart(static_cast<const MoxElement&>(*node)));
    } else {
        addText(events, toXmlText(node->getText()));
    }
}

std::string describe(const std::vector<XmlEvent>& events, std::size_t place) {
    if (place >= events.size()) {
        return "the end";
    }
    std::string text = events[place].name + ":" + events[place].text;
    for (const auto& [name, value] : events[place].attributes) {
        text.append(" ").append(name).append("='").append(value).append("'");
    }
    return text;
}

bool isSame(const XmlEvent& one, const XmlEvent& other) {
    return one.kind == other.kind && one.name == other.name && one.text == other.text &&
           one.attributes == other.attributes;
}

} // namespace

std::string toXmlText(const UnicodeString& text) {
    UnicodeString fit;
    for (std::int32_t i = 0; i < text.length(); i = text.moveIndex32(i, 1)) {
        const UChar32 character = text.char32At(i);
        fit.append(isXmlChar(character) ? character : UChar32{0xFFFD});
    }
    std::string bytes;
    return fit.toUTF8String(bytes);
}

std::vector<XmlEvent> readTree(const MoxDocument& document) {
    std::vector<XmlEvent> events;
    const MoxNode* node = document.getFirstChild();
    while (node) {
        open(events, node);
        const MoxNode* next = node->getFirstChild();
        while (!next && node && node != &document) {
            close(events, node);
            next = node->getNextSibling();
            node = node->getParentNode();
        }
        node = next;
    }
    const MoxElement* root = document.getDocumentElement();
    if (root && root->getNamespaceURI()) {
        events.front().attributes.emplace(events.front().attributes.begin(), "xmlns",
                                          nameOf(root->getNamespaceURI()));
    }
    return events;
}

std::string findDifference(const std::vector<XmlEvent>& tree, const std::vector<XmlEvent>& read) {
    const auto [left, right] =
        std::mismatch(tree.begin(), tree.end(), read.begin(), read.end(), isSame);
    if (left == tree.end() && right == read.end()) {
        return {};
    }
    return describe(tree, static_cast<std::size_t>(left - tree.begin())) + " was read as " +
           describe(read, static_cast<std::size_t>(right - read.begin()));
}

} // namespace DrawmereTest
