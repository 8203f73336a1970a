/// A document that is drawn into below the public class.
#pragma once

#include "draw/SVGFullImpl.h"
#include "foundation/common/MoxNameTable.h"
#include "tests/support/SvgPage.h"
#include "tests/support/Utf8.h"

#include <sstream>
#include <string>

namespace DrawmereTest {

using namespace DrawmereNS;

/// Returns: the subtree at `node` as it is saved, one tag a line.
inline std::string toXml(const MoxDocument& document, const MoxNode* node) {
    std::ostringstream stream;
    document.save(UnicodeString(), UnicodeString(), stream, node, UnicodeString(), UnicodeString());
    std::string text = stream.str();
    text.erase(0, text.starts_with("<?xml") ? text.find('\n') + 1 : 0);
    while (text.ends_with('\n')) {
        text.pop_back();
    }
    return splitTags(text);
}

/// A document with a root, drawn by an implementation of the caller's choice.
template <typename Impl = SVGFullImpl> struct DrawnTree {
    explicit DrawnTree(SVGConfig::SVGTYPE profile = SVGConfig::SVGTYPE_FULL) {
        config.svgType = profile;
        impl.initRootSvg();
    }

    MoxElement* root() { return impl.getDocument()->getDocumentElement(); }

    /// Returns: an element that stands nowhere yet.
    MoxPtr<SVGElement> make(SVGName name) { return impl.getDocument()->createSVGElement(name); }

    /// Returns: the one element below the root, as it is saved.
    std::string shape() {
        impl.finishRootSvg();
        return toXml(*impl.getDocument(), root()->getFirstChild()->getFirstChild());
    }

    /// Returns: what stands below the root, one tag a line.
    std::string content() {
        std::string text;
        for (const MoxNode* child = root()->getFirstChild(); child;
             child = child->getNextSibling()) {
            text += toXml(*impl.getDocument(), child) + "\n";
        }
        return text;
    }

    /// Returns: an attribute of the root as text.
    std::string rootAttribute(SVGName name) { return utf8(root()->getAttribute(name).toString()); }

    SVGConfig config;
    Impl impl{&config};
};

} // namespace DrawmereTest
