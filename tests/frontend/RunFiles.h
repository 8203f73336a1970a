/// A run that writes its files into a directory of its own.
#pragma once

#include "tests/support/SvgPage.h"
#include "tests/support/TempDir.h"
#include "tests/support/Utf8.h"

namespace DrawmereTest {

using namespace DrawmereNS;

/// Handles failures by remembering them, and returns.
class RememberingHandler : public DrawmereErrHandler {
public:
    void handleError(const MoxError& error) override {
        told += std::to_string(error.getCode()) + " " + utf8(error.getMessage()) + "\n";
    }

    void handleError() override { told += "other\n"; }

    std::string told; ///< number and text of each error, one a line, and "other" for what is none
};

/// The run "out.svg" in a temporary directory, one file a page.
struct RunFiles {
    explicit RunFiles(const std::string& name = "out.svg") : uri(directory.uri(name)) {
        config.streamOutput = false;
    }

    /// Opens a document.
    void open() { drawmere.initRootSvg(uri.getText()); }

    /// Begins a page with a circle of the page number's radius.
    void begin(int number) {
        drawmere.startPage(number, MoxRectT<MoxLength>(pt(0), pt(0), pt(100), pt(100)));
        drawmere.drawCircle(pt(50), pt(50), pt(static_cast<float>(number)), PAINTMODE_NONE);
    }

    /// Draws a page as a document of its own; `link` is where a link on it leads, `anchor` a
    /// destination on it.
    void drawPage(int number, const UnicodeString& link = UnicodeString(),
                  const UnicodeString& anchor = UnicodeString()) {
        open();
        begin(number);
        if (!link.isEmpty()) {
            drawmere.startLink(link, MoxName());
            drawmere.drawCircle(pt(1), pt(1), pt(1), PAINTMODE_NONE);
            drawmere.endLink();
        }
        if (!anchor.isEmpty()) {
            drawmere.setInternalLinkAnchor(anchor, 0, 0);
        }
        drawmere.endPage();
        drawmere.finishRootSvg();
    }

    /// Returns: the names of the files in the directory, sorted, with blanks between them.
    std::string list() const {
        std::set<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(directory.path())) {
            names.insert(entry.path().filename().string());
        }
        std::string text;
        for (const std::string& name : names) {
            text += (text.empty() ? "" : " ") + name;
        }
        return text;
    }

    /// Returns: whether the file `name` is the complete document of this page.
    bool holdsPage(const std::string& name, int number) const {
        const std::string text = directory.read(name);
        return text.find("r=\"" + std::to_string(number) + "\"") != std::string::npos &&
               text.ends_with("</svg>\n");
    }

    TempDir directory;
    SVGConfig config;
    SVGPageUri uri;
    Drawmere drawmere{&config, &uri};
};

/// Returns: number and text of the error that `action` throws, nothing when it throws none.
template <typename Action> std::string errorOf(Action action) {
    try {
        action();
    } catch (const MoxError& error) {
        return std::to_string(error.getCode()) + " " + utf8(error.getMessage());
    }
    return "";
}

/// Returns: the same for a file that can't be made or written.
inline std::string unwritable(const std::string& path) {
    return "16414 Specified uri that svg output (" + path + ") couldn't create.";
}

} // namespace DrawmereTest
