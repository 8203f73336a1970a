/// Writes the links of a page and the places that links lead to.
#pragma once

#include "tools/convert/Canvas.h"
#include "tools/convert/LinkReader.h"
#include "tools/convert/PageReport.h"
#include "tools/convert/PageTargets.h"

#include <vector>

namespace DrawmereConvert {

/// Serves one page. Shape: `page` counts from 0; `shift` leads to the coordinates of the document.
class LinkWriter {
public:
    LinkWriter(Canvas& target, const PageTargets& pageTargets, int pageIndex, const fz_point& move)
        : canvas(target), targets(pageTargets), page(pageIndex), shift(move) {}

    /// Writes what other links lead to.
    void writeDestinations();

    /// Lays a transparent rectangle over each link that leads to something, and notes it in the
    /// report.
    void writeLinks(const std::vector<PageLink>& links, PageReport& report);

private:
    void writePoint(const LinkDestination& destination);
    UnicodeString findTarget(const PageLink& link) const;

    Canvas& canvas;
    const PageTargets& targets;
    int page;
    fz_point shift;
};

/// Returns: the destination to which a link in a single file leads that means all of a page.
LinkDestination makePageDestination(int page);

} // namespace DrawmereConvert
