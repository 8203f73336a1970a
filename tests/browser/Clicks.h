/// Clicks on links in a browser.
#pragma once

#include <string>
#include <vector>

namespace DrawmereTest {

/// Where a click on a link led.
struct Click {
    /// Returns: whether a text of just these characters is in sight.
    bool sees(const std::string& text) const;

    std::string label; ///< the text of the link
    std::string where; ///< the name of the file and the fragment, "nowhere" without a document
    bool inNewWindow = false;
    double scale = 0.0;                  ///< pixels for a unit of the document
    std::vector<std::string> texts = {}; ///< in sight
};

/// Opens `file`, a path that may have a fragment, in headless Chromium and clicks the links in
/// sight, each from there anew. Fails the test when the browser can't.
/// Shape: `numbers`, which of the links to click, in the words of digits; all without any.
std::vector<Click> followLinks(const std::string& file,
                               const std::vector<std::string>& numbers = {});

} // namespace DrawmereTest
