/// What the tests of the passes for small devices share.
#pragma once

#include "post/QuilletExtention.h"
#include "tests/post/ReadTree.h"

#include <string>

namespace DrawmereTest {

inline QuilletExtention makeQuillet() {
    QuilletExtention quillet;
    for (const char* element :
         {"circle", "ellipse", "line", "path", "polygon", "polyline", "rect", "text"}) {
        quillet.paintableElements.insert(toName(element));
    }
    quillet.paintAttributes = {toName("fill"), toName("stroke")};
    return quillet;
}

/// Returns: the tree after one of the passes over its root.
inline std::string pass(void (QuilletExtention::*operation)(MoxElement*), const std::string& xml) {
    const MoxPtr<SVGDocument> document = readTree(xml);
    (makeQuillet().*operation)(document->getDocumentElement());
    return writeTree(*document);
}

/// Definitions of two images, "i0" and "i1".
inline const std::string twoImages = "<image id=\"i0\" width=\"100%\" height=\"100%\" "
                                     "preserveAspectRatio=\"none meet\" xlink:href=\"data:0\"/>"
                                     "<image id=\"i1\" width=\"100%\" height=\"100%\" "
                                     "preserveAspectRatio=\"none meet\" xlink:href=\"data:1\"/>";

inline const std::string rootTag = "<svg xmlns:xlink=\"http://www.w3.org/1999/xlink\">";

/// Returns: what refers to an image where it is drawn.
inline std::string frame(const std::string& reference) {
    return "<svg width=\"3\" height=\"4\" x=\"1\" y=\"2\"><use xlink:href=\"" + reference +
           "\" opacity=\".5\"/></svg>";
}

/// Returns: the image in place of such a frame.
inline std::string placed(const std::string& uri) {
    return R"(<image width="3" height="4" x="1" y="2" preserveAspectRatio="none meet" )"
           "xlink:href=\"" +
           uri + "\"/>";
}

} // namespace DrawmereTest
