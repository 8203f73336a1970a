#include "foundation/common/MoxXmlWriter.h"

#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxPackedNode.h"
#include "foundation/common/MoxText.h"
#include "foundation/common/MoxXmlUtil.h"

#include <algorithm>
#include <set>
#include <unicode/utf16.h>

namespace MoxCommonNS {
namespace {

/// Deeper levels are indented like this one, so that a deep tree does not grow by its square.
constexpr std::size_t maxIndentedDepth = 64;

bool holdsText(const MoxElement& element) {
    const MoxNode* child = element.firstLink();
    while (child && child->kindLink() != MOXNODE_TEXT) {
        child = child->nextLink();
    }
    return child != nullptr;
}

} // namespace

MoxXmlWriter::MoxXmlWriter(std::ostream& stream, const UnicodeString& encoding,
                           const MoxXmlOptions& writeOptions)
    : sink(stream, encoding), options(writeOptions) {}

void MoxXmlWriter::writeDocument(const UnicodeString& doctype, const MoxNode* node) {
    sink.write("<?xml version=\"1.0\" encoding=\"");
    sink.write(sink.getEncodingName());
    sink.write("\"?>\n");
    if (!doctype.isEmpty()) {
        std::string bytes;
        sink.write("<!DOCTYPE ");
        sink.write(doctype.toUTF8String(bytes));
        sink.write(">\n");
    }
    const MoxNode* root = node->kindLink() == MOXNODE_DOCUMENT ? node->firstLink() : node;
    if (root) {
        writeTree(root);
        sink.write('\n');
    }
    sink.finish();
}

void MoxXmlWriter::writeTree(const MoxNode* root) {
    const MoxNode* node = root;
    while (node) {
        openNode(*node);
        if (node->firstLink()) {
            node = node->firstLink();
            continue;
        }
        while (node != root && !node->nextLink()) {
            node = node->parentLink();
            closeElement(static_cast<const MoxElement&>(*node));
        }
        node = node == root ? nullptr : node->nextLink();
    }
}

void MoxXmlWriter::openNode(const MoxNode& node) {
    if (node.kindLink() == MOXNODE_TEXT) {
        writeText(static_cast<const MoxText&>(node).getContent(), /*inAttribute=*/false);
        return;
    }
    if (node.kindLink() == MOXNODE_PACKED) {
        writePacked(static_cast<const MoxPackedNode&>(node).getBytes());
        return;
    }
    beginElement();
    const auto& element = static_cast<const MoxElement&>(node);
    writeStartTag(element);
    if (element.firstLink()) {
        beginContent(options.indent && holdsText(element));
    } else {
        sink.write("/>");
    }
}

void MoxXmlWriter::closeElement(const MoxElement& element) {
    endContent();
    while (!declarations.empty() && declarations.back().element == &element) {
        declarations.pop_back();
    }
    sink.write("</");
    writeTagName(element);
    sink.write('>');
}

/// Goes to the place of a start tag.
void MoxXmlWriter::beginElement() {
    if (depth > 0 && options.indent && mixedDepth == 0) {
        breakLine();
    }
}

/// Ends the start tag of an element with children.
void MoxXmlWriter::beginContent(bool hasText) {
    sink.write('>');
    ++depth;
    if (hasText && mixedDepth == 0) {
        mixedDepth = depth;
    }
}

/// Goes to the place of an end tag.
void MoxXmlWriter::endContent() {
    if (mixedDepth == depth) {
        mixedDepth = 0;
        --depth;
        return;
    }
    --depth;
    if (options.indent && mixedDepth == 0) {
        breakLine();
    }
}

void MoxXmlWriter::writeStartTag(const MoxElement& element) {
    sink.write('<');
    writeTagName(element);
    writeAttributes(element, element.getNamespaceURI() ? declareNamespace(element) : std::string());
}

void MoxXmlWriter::writeTagName(const MoxElement& element) {
    if (element.prefixLink()) {
        writeName(element.prefixLink());
        sink.write(':');
    }
    writeName(element.localLink());
}

void MoxXmlWriter::writeName(MoxName name) {
    const MoxNameTable::Entry& entry = MoxNameTable::getEntry(name);
    if (entry.isPlain) {
        sink.write(entry.xmlName);
    } else {
        sink.write(getWritableName(entry));
    }
}

/// Characters that the encoding lacks become underscores, as a name can't hold references.
std::string MoxXmlWriter::getWritableName(const MoxNameTable::Entry& entry) {
    if (entry.xmlName.empty()) {
        return "_";
    }
    if (entry.isPlain || !sink.isConverting()) {
        return entry.xmlName;
    }
    UnicodeString name = UnicodeString::fromUTF8(entry.xmlName);
    for (std::int32_t i = 0; i < name.length(); i = name.moveIndex32(i, 1)) {
        const UChar32 codePoint = name.char32At(i);
        if (!sink.canCarry(codePoint)) {
            name.replace(i, U16_LENGTH(codePoint), u'_');
        }
    }
    std::string result;
    return name.toUTF8String(result);
}

/// Returns: the name of the declaration that it wrote, empty when none was needed.
std::string MoxXmlWriter::declareNamespace(const MoxElement& element) {
    const MoxName prefix = element.prefixLink();
    const MoxName uri = element.getNamespaceURI();
    static const MoxName xmlns(UnicodeString(u"xmlns"));
    if (isDeclared(prefix, uri) || element.hasAttribute(MoxXmlUtil::makeQName(
                                       prefix ? xmlns : MoxName(), prefix ? prefix : xmlns))) {
        return {};
    }
    std::string name = "xmlns";
    if (prefix) {
        name.append(":").append(getWritableName(MoxNameTable::getEntry(prefix)));
    }
    if (element.firstLink()) {
        declarations.push_back({&element, prefix, uri});
    }
    writeAttribute(name, MoxValue(uri));
    return name;
}

/// Remembers a declaration that stands among the attributes for what is below `element`.
void MoxXmlWriter::noteDeclaration(const MoxElement& element, const MoxValue& attribute) {
    constexpr std::int32_t prefixStart = 6; // behind "xmlns:"
    const UnicodeString& name = MoxNameTable::getSharedNameString(attribute.getKey());
    if (element.firstLink() && name.startsWith(u"xmlns")) {
        const MoxName prefix(name.tempSubString(prefixStart));
        declarations.push_back({&element, prefix, MoxName(attribute.toString())});
    }
}

void MoxXmlWriter::writeAttributes(const MoxElement& element, const std::string& declared) {
    for (const MoxValue& attribute : element.attributeLinks()) {
        const MoxNameTable::Entry& entry = MoxNameTable::getEntry(attribute.getKey());
        if (!entry.isPlain) {
            writeOddAttributes(element, &attribute, declared);
            return;
        }
        sink.write(entry.attributeStart);
        writeValue(attribute);
        sink.write('"');
    }
}

/// Goes on with attributes from `first`, whose name is not plain: once it is made fit for XML it
/// may be that of another attribute, and only one of them can be written.
void MoxXmlWriter::writeOddAttributes(const MoxElement& element, const MoxValue* first,
                                      const std::string& declared) {
    std::set<std::string> used = {declared};
    for (const MoxValue& attribute : element.attributeLinks()) {
        const MoxNameTable::Entry& entry = MoxNameTable::getEntry(attribute.getKey());
        if (entry.isPlain) {
            used.insert(entry.xmlName);
        }
    }
    for (; first != element.attributeLinks().end(); ++first) {
        const MoxNameTable::Entry& entry = MoxNameTable::getEntry(first->getKey());
        const std::string name = getWritableName(entry);
        if (entry.isPlain || used.insert(name).second) {
            noteDeclaration(element, *first);
            writeAttribute(name, *first);
        }
    }
}

bool MoxXmlWriter::isDeclared(MoxName prefix, MoxName uri) const {
    const auto found =
        std::find_if(declarations.rbegin(), declarations.rend(),
                     [prefix](const Declaration& known) { return known.prefix == prefix; });
    return found != declarations.rend() && found->uri == uri;
}

void MoxXmlWriter::writeAttribute(std::string_view name, const MoxValue& value) {
    sink.write(' ');
    sink.write(name);
    sink.write("=\"");
    writeValue(value);
    sink.write('"');
}

void MoxXmlWriter::writeValue(const MoxValue& value) {
    switch (value.getType()) {
    case MOXVALUE_STRING:
        if (const MoxKeptText* const kept = value.getKeptText()) {
            writeKept(*kept);
        } else {
            writeText(value, /*inAttribute=*/true);
        }
        return;
    case MOXVALUE_REAL:
        writeReal(value.getFloat());
        return;
    case MOXVALUE_INTEGER:
        writeInteger(value.getIntegerValue());
        return;
    case MOXVALUE_NAME:
        writeNameText(value.getNameValue());
        return;
    default:
        writeText(MoxValue(value.toString()), /*inAttribute=*/true);
        return;
    }
}

void MoxXmlWriter::writeReal(float value) {
    char* out = sink.room(maxRealText);
    const std::size_t length = options.decimals == MoxXmlOptions::allDecimals
                                   ? MoxCommonNS::writeReal(value, out)
                                   : writeRoundedReal(value, options.decimals, out);
    sink.advance(out + length);
}

void MoxXmlWriter::writeInteger(std::int32_t value) {
    char* out = sink.room(maxIntegerText);
    sink.advance(out + MoxCommonNS::writeInteger(value, out));
}

void MoxXmlWriter::writeNameText(MoxName name) {
    const MoxNameTable::Entry& entry = MoxNameTable::getEntry(name);
    if (entry.isPlain) {
        sink.write(entry.xmlName); // a name holds nothing that would have to be escaped
    } else {
        writeText(MoxValue(entry.text), /*inAttribute=*/true);
    }
}

void MoxXmlWriter::breakLine() {
    constexpr std::string_view blanks = "                                                        "
                                        "                                                        "
                                        "                ";
    static_assert(blanks.size() == 2 * maxIndentedDepth);
    sink.write('\n');
    sink.write(blanks.substr(0, 2 * std::min(depth, maxIndentedDepth)));
}

} // namespace MoxCommonNS
