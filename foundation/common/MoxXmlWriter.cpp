#include "foundation/common/MoxXmlWriter.h"

#include "foundation/common/MoxNumberText.h"
#include "foundation/common/MoxText.h"
#include "foundation/common/MoxXmlChars.h"
#include "foundation/common/MoxXmlScan.h"
#include "foundation/common/MoxXmlUtil.h"

#include <algorithm>
#include <array>
#include <set>
#include <unicode/utf16.h>
#include <unicode/utf8.h>

namespace MoxCommonNS {
namespace {

/// Deeper levels are indented like this one, so that a deep tree does not grow by its square.
constexpr std::size_t maxIndentedDepth = 64;

constexpr std::string_view lineFeedReference = "&#10;";

struct Escape {
    char character;
    bool onlyInAttributes;
    std::string_view reference;
};

// A line feed or a tab in an attribute, and a carriage return anywhere, would be changed by a
// reader. What the byte of a delete character means differs from reader to reader.
constexpr Escape escapes[] = {
    {'<', false, "&lt;"},   {'&', false, "&amp;"},     {'>', false, "&gt;"},
    {'"', true, "&quot;"},  {'\t', true, "&#9;"},      {'\n', true, lineFeedReference},
    {'\r', false, "&#13;"}, {'\x7F', false, "&#127;"},
};

/// Bit 1: not as it is in text; bit 2: not as it is in an attribute.
constexpr std::array<std::uint8_t, 128> specialCharacters = [] {
    std::array<std::uint8_t, 128> marks = {};
    for (UChar32 c = 0; c < 128; ++c) {
        marks[c] = isXmlChar(c) ? 0 : 3;
    }
    for (const Escape& escape : escapes) {
        marks[static_cast<unsigned char>(escape.character)] = escape.onlyInAttributes ? 2 : 3;
    }
    return marks;
}();

bool isSpecial(char16_t c, bool inAttribute) {
    return (specialCharacters[c] & (inAttribute ? 2 : 1)) != 0;
}

/// The control characters behind ASCII: not every reader has them in the encodings of one byte.
bool isControl(UChar32 codePoint) { return codePoint >= 0x80 && codePoint < 0xA0; }

bool mustEscape(UChar32 codePoint, bool inAttribute) {
    return codePoint < 128 ? isSpecial(static_cast<char16_t>(codePoint), inAttribute)
                           : isControl(codePoint) || !isXmlChar(codePoint);
}

/// Reads what stands at `i` and moves `i` behind it; half a surrogate pair comes as it is.
UChar32 takeCodePoint(std::u16string_view text, std::size_t& i) {
    UChar32 codePoint = 0;
    U16_NEXT(text.data(), i, text.size(), codePoint);
    return codePoint;
}

/// Returns: the end of the bytes.
char* writeUtf8(UChar32 codePoint, char* out) {
    std::size_t length = 0;
    auto* bytes = reinterpret_cast<std::uint8_t*>(out);
    U8_APPEND_UNSAFE(bytes, length, codePoint);
    return out + length;
}

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
    if (depth > 0 && options.indent && !mixedElement) {
        breakLine();
    }
    const auto& element = static_cast<const MoxElement&>(node);
    writeStartTag(element);
    if (!element.firstLink()) {
        sink.write("/>");
        return;
    }
    sink.write('>');
    ++depth;
    if (options.indent && !mixedElement && holdsText(element)) {
        mixedElement = &element;
    }
}

void MoxXmlWriter::closeElement(const MoxElement& element) {
    --depth;
    if (options.indent && !mixedElement) {
        breakLine();
    }
    if (mixedElement == &element) {
        mixedElement = nullptr;
    }
    while (!declarations.empty() && declarations.back().element == &element) {
        declarations.pop_back();
    }
    sink.write("</");
    writeTagName(element);
    sink.write('>');
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

void MoxXmlWriter::writeText(const MoxValue& text, bool inAttribute) {
    if (text.isWideText()) {
        writeWide(text.getWideText(), inAttribute);
    } else {
        writeAscii(text.getAsciiText(), inAttribute);
    }
}

void MoxXmlWriter::writeAscii(std::string_view text, bool inAttribute) {
    std::size_t start = 0;
    std::size_t i = findXmlMarkup(text, 0);
    while (i < text.size()) {
        const auto c = static_cast<unsigned char>(text[i]);
        if (isSpecial(c, inAttribute)) {
            sink.write(text.substr(start, i - start));
            writeEscaped(c, inAttribute);
            start = i + 1;
        }
        i = findXmlMarkup(text, i + 1);
    }
    sink.write(text.substr(start));
}

/// A document with a hole must not pass for a whole one, so a text that is lost ends the writing.
void MoxXmlWriter::writeKept(const MoxKeptText& text) {
    static_assert(lineFeedReference.size() <= MoxKeptText::maxLineFeed);
    const auto write = [this](std::string_view piece) { sink.write(piece); };
    if (!text.handOut(lineFeedReference, write)) {
        sink.fail();
    }
}

void MoxXmlWriter::writeWide(std::u16string_view text, bool inAttribute) {
    std::size_t i = 0;
    while (i < text.size()) {
        const UChar32 codePoint = takeCodePoint(text, i);
        if (mustEscape(codePoint, inAttribute)) {
            writeEscaped(codePoint, inAttribute);
        } else {
            sink.advance(writeUtf8(codePoint, sink.room(U8_MAX_LENGTH)));
        }
    }
}

void MoxXmlWriter::writeEscaped(UChar32 codePoint, bool inAttribute) {
    for (const Escape& escape : escapes) {
        if (escape.character == codePoint && (inAttribute || !escape.onlyInAttributes)) {
            sink.write(escape.reference);
            return;
        }
    }
    if (isControl(codePoint)) {
        sink.write("&#");
        writeInteger(codePoint);
        sink.write(';');
        return;
    }
    // The replacement character U+FFFD stands for what XML forbids.
    sink.write("\xEF\xBF\xBD");
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
