/// Documents for the converter to read.
#pragma once

#include <string>
#include <vector>

namespace DrawmereTest {

/// Writes a PDF file in which pages are told apart by their content.
class TinyPdf {
public:
    /// Adds a page of 200 by 100 points.
    /// Shape: `content`, operators; `extra`, further entries of the page's dictionary.
    TinyPdf& addPage(const std::string& content, const std::string& extra = std::string());

    /// Adds a page with a square that is larger from page to page.
    TinyPdf& addPlainPage();

    /// Adds a page with a link to another, counted from 0.
    TinyPdf& addLinkPage(int target);

    /// Adds a page that takes longer to draw than anyone waits.
    TinyPdf& addEndlessPage();

    /// Returns: the bytes of the file.
    std::string write() const;

private:
    struct Page {
        std::string content;
        std::string extra;
    };

    std::vector<Page> pages;
};

/// Returns: a document of so many plain pages.
std::string makePlainPdf(int pageCount);

} // namespace DrawmereTest
