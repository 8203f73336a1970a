#include "tools/convert/LinkWriter.h"

#include "tools/convert/Rectangles.h"

namespace DrawmereConvert {
namespace {

const Paint unseen{MoxColor(0, 0, 0, 0)}; // black is what the root says anyway

} // namespace

LinkDestination makePageDestination(int page) {
    LinkDestination destination;
    destination.id = u"page-" + UnicodeString::fromUTF8(std::to_string(page + 1));
    return destination;
}

void LinkWriter::writeDestinations() {
    const auto index = static_cast<std::size_t>(page);
    if (index >= targets.destinations.size()) {
        return;
    }
    for (const LinkDestination& destination : targets.destinations[index]) {
        if (destination.isView) {
            canvas.flush();
            canvas.out.setInternalView(destination.id, destination.x + shift.x,
                                       destination.y + shift.y, destination.width,
                                       destination.height);
        } else {
            writePoint(destination);
        }
    }
}

// An anchor's own transform has no room for a point, so the coordinate system goes there. The inner
// push moves it from the anchor to the group around.
void LinkWriter::writePoint(const LinkDestination& destination) {
    canvas.flush();
    canvas.settings.setFill({});
    canvas.settings.setNoStroke();
    canvas.push();
    canvas.transform(fz_translate(destination.x + shift.x, destination.y + shift.y));
    canvas.push();
    canvas.out.setInternalLinkAnchor(destination.id, 0, 0);
    canvas.pop();
    canvas.pop();
}

UnicodeString LinkWriter::findTarget(const PageLink& link) const {
    if (link.page < 0) {
        const bool isRelative =
            link.uri.starts_with("file://") && !link.uri.starts_with("file:///");
        return UnicodeString::fromUTF8(isRelative ? link.uri.substr(7) : link.uri);
    }
    const auto index = static_cast<std::size_t>(link.page);
    if (index >= targets.files.size() || targets.files[index].isEmpty()) {
        return {}; // that page is not converted
    }
    const UnicodeString& id = link.destination.id;
    if (targets.singleFile) {
        return u"#" + (id.isEmpty() ? makePageDestination(link.page).id : id);
    }
    if (id.isEmpty()) {
        return targets.files[index];
    }
    return (link.page == page ? UnicodeString() : targets.files[index]) + u"#" + id;
}

void LinkWriter::writeLinks(const std::vector<PageLink>& links, PageReport& report) {
    for (const PageLink& link : links) {
        const UnicodeString target = findTarget(link);
        const fz_rect area = fz_translate_rect(link.area, shift.x, shift.y);
        if (fz_is_empty_rect(area)) {
            continue;
        }
        if (target.isEmpty()) {
            report.note(APPROXIMATION_LINK);
            continue;
        }
        canvas.beginLink(target, /*isNewWindow=*/false);
        canvas.fill(toPath(area), /*isEvenOdd=*/true, unseen);
        canvas.endLink();
        std::string text;
        report.links.push_back(
            {area.x0, area.y0, area.x1 - area.x0, area.y1 - area.y0, target.toUTF8String(text)});
    }
}

} // namespace DrawmereConvert
