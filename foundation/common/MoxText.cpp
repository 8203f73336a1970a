#include "foundation/common/MoxText.h"

namespace MoxCommonNS {

MoxText::MoxText(MoxDocument* document, const UnicodeString& text)
    : MoxNode(MOXNODE_TEXT, document), content(text) {}

const char* MoxText::getTypeName() const { return "MoxText"; }

MoxName MoxText::getNodeName() const {
    static const MoxName name(UnicodeString(u"#text"));
    return name;
}

MoxValue MoxText::getNodeValue() const { return content; }

UnicodeString MoxText::getText() const { return content.toString(); }

void MoxText::setText(const UnicodeString& text) { content = MoxValue(text); }

MoxPtr<MoxNode> MoxText::cloneAlone() const { return new MoxText(getOwnerDocument(), getText()); }

} // namespace MoxCommonNS
