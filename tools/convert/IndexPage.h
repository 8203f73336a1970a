/// A page that shows all pages.
#pragma once

#include "tools/convert/DocumentConverter.h"

#include <string>
#include <vector>

namespace DrawmereConvert {

/// A place in a page to which links lead.
struct IndexAnchor {
    std::string id; ///< UTF-8
    float y = 0;    ///< points from the top
};

/// A page as the index shows it.
struct IndexEntry {
    std::string file; ///< UTF-8, as a reference from the index
    int page = 0;     ///< counted from 0 in its document
    PageSize size;
    std::vector<LinkArea> links;
    std::vector<IndexAnchor> anchors;
};

/// A document as the index shows it.
struct IndexDocument {
    std::string title;    ///< UTF-8
    std::string language; ///< of the outline, as in "de"; empty when it is not known
    std::vector<OutlineEntry> outline;
    std::vector<IndexEntry> entries;
};

/// Returns: the page as HTML: all pages below each other, each read when it comes near, with their
/// links, the outlines, buttons and keys for the next and previous page and for the size. It needs
/// nothing but the files of the pages.
std::string makeIndexPage(const std::vector<IndexDocument>& documents);

/// Returns: whether `bytes` begin like a page that `makeIndexPage` made.
bool isIndexPage(const std::string& bytes);

} // namespace DrawmereConvert
