/// Links and the outline of a document.
#pragma once

#include "tools/convert/OutlineEntry.h"
#include "tools/convert/PageTargets.h"

#include <mupdf/fitz.h>

#include <string>
#include <string_view>
#include <vector>

namespace DrawmereConvert {

/// A link of a page. Without a URI and a page it leads nowhere: to a place that isn't in the
/// document, or to what `leadsToPlace` turns away.
struct PageLink {
    fz_rect area{};              ///< where it can be clicked, in the coordinates of the page
    std::string uri;             ///< UTF-8, of a link that leads out of the document
    int page = -1;               ///< from 0, to which it leads otherwise
    LinkDestination destination; ///< the place there, with an empty id for the page as a whole
};

/// Returns: whether a reader may be led to `uri`: a relative path, or a scheme of a place. A script
/// is none; a browser that shows the page would run it.
bool leadsToPlace(std::string_view uri);

/// Returns: the links of `page`; none when they can't be read.
std::vector<PageLink> readLinks(fz_context* ctx, fz_document* document, fz_page* page);

/// Returns: the outline; none when it can't be read.
std::vector<OutlineEntry> readOutline(fz_context* ctx, fz_document* document);

} // namespace DrawmereConvert
