/// Writes a tree as XML.
#pragma once

#include "foundation/common/MoxDocument.h"
#include "foundation/common/MoxKeptText.h"
#include "foundation/common/MoxNameTable.h"
#include "foundation/common/MoxPackedForm.h"
#include "foundation/common/MoxXmlOptions.h"
#include "foundation/common/MoxXmlSink.h"

#include <string>
#include <vector>

namespace MoxCommonNS {

/// Writes documents in one pass, without recursion: whatever the nodes hold, the result is
/// well-formed, and a reader gets back the values that were set.
class MoxXmlWriter {
public:
    MoxXmlWriter(std::ostream& stream, const UnicodeString& encoding, const MoxXmlOptions& options);

    /// Writes the XML declaration, a document type declaration unless `doctype` is empty, and the
    /// tree at `node`, a document, an element or a text.
    void writeDocument(const UnicodeString& doctype, const MoxNode* node);

private:
    /// A namespace declaration in force, and the element that carries it.
    struct Declaration {
        const MoxElement* element;
        MoxName prefix;
        MoxName uri;
    };

    void writeTree(const MoxNode* root);
    void openNode(const MoxNode& node);
    void beginElement();
    void beginContent(bool hasText);
    void endContent();
    void writePacked(std::string_view bytes);
    void writePackedElement(const MoxPackedHead& head, MoxPackedCursor& cursor);
    void writePackedValue(const MoxPackedValue& value, bool inAttribute);
    void writePairs(const MoxPackedValue& value);
    void closeElement(const MoxElement& element);
    void writeStartTag(const MoxElement& element);
    void writeTagName(const MoxElement& element);
    std::string declareNamespace(const MoxElement& element);
    void noteDeclaration(const MoxElement& element, const MoxValue& attribute);
    void writeName(MoxName name);
    std::string getWritableName(const MoxNameTable::Entry& entry);
    void writeAttributes(const MoxElement& element, const std::string& declared);
    void writeOddAttributes(const MoxElement& element, const MoxValue* first,
                            const std::string& declared);
    void writeAttribute(std::string_view name, const MoxValue& value);
    void writeValue(const MoxValue& value);
    void writeReal(float value);
    void writeInteger(std::int32_t value);
    void writeNameText(MoxName name);
    void writeText(const MoxValue& text, bool inAttribute);
    void writeAscii(std::string_view text, bool inAttribute);
    void writeKept(const MoxKeptText& text);
    void writeWide(std::u16string_view text, bool inAttribute);
    void writeEscaped(UChar32 codePoint, bool inAttribute);
    void breakLine();
    bool isDeclared(MoxName prefix, MoxName uri) const;

    MoxXmlSink sink;
    MoxXmlOptions options;
    std::vector<Declaration> declarations;
    std::size_t depth = 0;
    std::size_t mixedDepth = 0;      // of the outermost element that holds text, 0 outside of one
    std::vector<MoxName> openPacked; // the packed elements whose children are being written
};

} // namespace MoxCommonNS
