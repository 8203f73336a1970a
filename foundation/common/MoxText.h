/// A text node.
#pragma once

#include "foundation/common/MoxNode.h"

namespace MoxCommonNS {

/// Characters between tags. The text is kept as a value, so plain ASCII takes a byte a character.
class DRAWMERE_API MoxText : public MoxNode {
public:
    /// A text of `document`, which may be null.
    MoxText(MoxDocument* document, const UnicodeString& text);

    const char* getTypeName() const override;
    MoxName getNodeName() const override;
    MoxValue getNodeValue() const override;
    UnicodeString getText() const override;
    void setText(const UnicodeString& text) override;

    /// Returns: the text as a string value, valid until it changes.
    const MoxValue& getContent() const { return content; }

protected:
    MoxPtr<MoxNode> cloneAlone() const override;

private:
    MoxValue content;
};

} // namespace MoxCommonNS
