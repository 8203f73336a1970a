/// A document in memory to draw into.
#pragma once

#include "Drawmere.h"

#include <sstream>
#include <string>
#include <utility>

namespace DrawmereTest {

/// Returns: a length of so many points.
inline DrawmereNS::MoxLength pt(float points) { return DrawmereNS::MoxLength::fromRaw(points); }

/// A document of 100 by 100 points that goes to a stream in memory, open and without a page anchor,
/// so that what is drawn first is the first element of its group. Reading its text finishes it.
class SvgPage {
public:
    explicit SvgPage(DrawmereNS::SVGConfig::SVGTYPE profile = DrawmereNS::SVGConfig::SVGTYPE_FULL);

    /// The drawing calls: `page->drawRect(...)`.
    DrawmereNS::Drawmere* operator->() { return &drawmere; }

    /// Returns: the document as it is written, with the XML declaration.
    const std::string& document();

    /// Returns: what stands in the root element, one tag a line and otherwise byte for byte.
    std::string body();

    /// Returns: the start tag of the root element.
    std::string rootTag();

    DrawmereNS::SVGConfig config;
    DrawmereNS::SVGPageUri uri{u"page.svg"};
    std::ostringstream stream;
    DrawmereNS::Drawmere drawmere{&config, &uri};

private:
    /// Where the start tag of the root element begins and where it ends.
    std::pair<std::size_t, std::size_t> findRootTag();

    bool finished = false;
    std::string text;
};

/// Returns: `xml` with a line feed between each tag and the next.
std::string splitTags(const std::string& xml);

} // namespace DrawmereTest
