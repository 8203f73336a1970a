/// Draws the pages of a document through the public interface of the library.
#pragma once

#include "Drawmere.h"
#include "tools/convert/ConvertError.h"
#include "tools/convert/ConvertOptions.h"
#include "tools/convert/OutlineEntry.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PageTargets.h"

#include <memory>
#include <string>
#include <vector>

namespace DrawmereConvert {

using DrawmereNS::Drawmere;

class DocumentFile;
class FontBook;
class GlyphOutlines;

/// The size of a page. Units: points.
struct PageSize {
    float width = 0;
    float height = 0;
};

/// Where a page is drawn.
struct PagePlace {
    int number = 1;       ///< handed to `Drawmere::startPage`, so it counts in file names
    float offset = 0;     ///< how far down the page begins in its document, in points
    bool isSingle = true; ///< the page is all of its document, so it sets the size of the canvas
};

/// One document. For each page: `loadPage`, then `Drawmere::initRootSvg`, `drawPage` and
/// `Drawmere::finishRootSvg`; or one root for all pages of a single file, with its canvas size set
/// by the caller. Pages may be drawn in any order and any number of times.
/// Threads: one object stays on one thread, except for `cancel`; several objects may have the same
/// file open.
class DocumentConverter {
public:
    explicit DocumentConverter(const ConvertOptions& options);
    DocumentConverter(const DocumentConverter&) = delete;
    DocumentConverter& operator=(const DocumentConverter&) = delete;
    ~DocumentConverter();

    /// Opens the file `path`. An empty `password` is none.
    /// Throws: ConvertError of any kind but a page's.
    void open(const std::string& path, const std::string& password);

    /// Returns: the count of pages, above 0 once a document is open.
    /// Has the image that the document is, if it is one, linked to in place of stored.
    /// Shape: `reference`, UTF-8, from the place of the pages.
    void link(const std::string& path, const std::string& reference);

    int getPageCount() const;

    /// Returns: the title from the document's own data, UTF-8, or nothing.
    std::string getTitle() const;

    /// Returns: the language that the document says it is in, such as "de", or nothing.
    std::string getLanguage() const;

    /// Returns: the outline; empty when there is none or it can't be read.
    std::vector<OutlineEntry> getOutline() const;

    /// Collects from the links of all pages that are converted where they lead.
    void findDestinations(PageTargets& targets);

    /// Reads a page, counted from 0, and holds it until the next call.
    /// Throws: ConvertError when the page can't be read.
    PageSize loadPage(int page);

    /// Draws the page read last into the open document of `drawmere`, from `startPage` to
    /// `endPage`. What can't be read is left out and said in the report.
    /// Throws: MoxError from the library.
    PageReport drawPage(const PagePlace& place, const PageTargets& targets, Drawmere& drawmere);

    /// Ends `drawPage` as soon as possible, with a page that is not complete. May be called from
    /// another thread; the next `loadPage` takes it back.
    void cancel();

private:
    void findDestinationsOf(int page, PageTargets& targets);

    ConvertOptions options;
    std::unique_ptr<DocumentFile> file;
    int currentPage = 0;                     // the one loaded last
    std::unique_ptr<GlyphOutlines> outlines; // kept from page to page
    std::unique_ptr<FontBook> fonts;         // likewise
};

} // namespace DrawmereConvert
