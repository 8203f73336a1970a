#include "tools/convert/LinkReader.h"

#include "tools/convert/FitzCall.h"

#include <mupdf/pdf.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cmath>

namespace DrawmereConvert {
namespace {

constexpr std::size_t maxEntries = 100'000; // a damaged outline can be a ring

float numberOr(float number, float other) { return std::isfinite(number) ? number : other; }

void appendNumber(UnicodeString& id, float number) {
    id.append(u'-');
    id.append(UnicodeString::fromUTF8(std::to_string(std::lround(number))));
}

// A name that tells the place, so that all links to one place share it in every run.
void setPoint(int page, float x, float y, LinkDestination& destination) {
    destination.x = std::max(x, 0.0F);
    destination.y = std::max(y, 0.0F);
    destination.id = u"dest";
    appendNumber(destination.id, static_cast<float>(page + 1));
    appendNumber(destination.id, destination.x);
    appendNumber(destination.id, destination.y);
}

/// Returns: the rectangle of a destination on its page. MuPDF takes points there, but leaves
/// rectangles of PDF documents as they stand in the file.
fz_rect placeView(fz_context* ctx, fz_document* document, int page, const fz_link_dest& target) {
    fz_rect view = {target.x, target.y, target.x + target.w, target.y + target.h};
    callFitz(ctx, [&] {
        pdf_document* const pdf = pdf_specifics(ctx, document);
        if (pdf) {
            fz_rect box{};
            fz_matrix matrix{};
            pdf_page_obj_transform(ctx, pdf_lookup_page_obj(ctx, pdf, page), &box, &matrix);
            view = fz_transform_rect(view, matrix);
        }
    });
    return view;
}

void setView(int page, const fz_rect& view, LinkDestination& destination) {
    destination.isView = true;
    destination.x = view.x0;
    destination.y = view.y0;
    destination.width = view.x1 - view.x0;
    destination.height = view.y1 - view.y0;
    destination.id = u"view";
    for (const float number : {static_cast<float>(page + 1), destination.x, destination.y,
                               destination.width, destination.height}) {
        appendNumber(destination.id, number);
    }
}

LinkDestination toDestination(fz_context* ctx, fz_document* document, int page,
                              const fz_link_dest& target) {
    LinkDestination destination;
    switch (target.type) {
    case FZ_LINK_DEST_FIT_R:
        if (target.w > 0 && target.h > 0) {
            setView(page, placeView(ctx, document, page, target), destination);
        }
        break;
    case FZ_LINK_DEST_XYZ:
    case FZ_LINK_DEST_FIT_H:
    case FZ_LINK_DEST_FIT_BH: {
        const float x = target.type == FZ_LINK_DEST_XYZ ? numberOr(target.x, 0) : 0;
        const float y = numberOr(target.y, 0);
        if (x > 0 || y > 0) {
            setPoint(page, x, y, destination);
        }
        break;
    }
    default: // the page as a whole
        break;
    }
    return destination;
}

PageLink toLink(fz_context* ctx, fz_document* document, const fz_link& link) {
    PageLink result;
    result.area = link.rect;
    const char* uri = link.uri;
    if (!uri) {
        return result;
    }
    if (fz_is_external_link(ctx, uri)) {
        result.uri = leadsToPlace(uri) ? uri : "";
        return result;
    }
    fz_link_dest target{};
    int page = -1;
    const bool isKnown = callFitz(ctx, [&] {
        target = fz_resolve_link_dest(ctx, document, uri);
        page = fz_page_number_from_location(ctx, document, target.loc);
    });
    if (isKnown && page >= 0) {
        result.page = page;
        result.destination = toDestination(ctx, document, page, target);
    }
    return result;
}

int findPage(fz_context* ctx, fz_document* document, const fz_outline& entry) {
    int page = -1;
    const char* uri = entry.uri;
    if (!uri) {
        return page; // MuPDF takes it for the first
    }
    const fz_location known = entry.page;
    callFitz(ctx, [&] {
        const bool isKnown = known.page >= 0;
        if (isKnown || !fz_is_external_link(ctx, uri)) {
            const fz_location place =
                isKnown ? known : fz_resolve_link_dest(ctx, document, uri).loc;
            page = fz_page_number_from_location(ctx, document, place);
        }
    });
    return page;
}

} // namespace

bool leadsToPlace(std::string_view uri) {
    const std::size_t colon = uri.find(':');
    if (colon == std::string_view::npos || uri.substr(0, colon).find('/') != std::string::npos) {
        return true;
    }
    constexpr std::array<std::string_view, 6> schemes = {"http", "https", "mailto",
                                                         "ftp",  "file",  "tel"};
    std::string scheme(uri.substr(0, colon));
    std::ranges::transform(scheme, scheme.begin(), [](unsigned char sign) {
        return static_cast<char>(std::tolower(sign));
    });
    return std::ranges::find(schemes, scheme) != schemes.end();
}

std::vector<PageLink> readLinks(fz_context* ctx, fz_document* document, fz_page* page) {
    fz_link* first = nullptr;
    std::vector<PageLink> links;
    callFitz(ctx, [&] { first = fz_load_links(ctx, page); });
    for (const fz_link* link = first; link; link = link->next) {
        links.push_back(toLink(ctx, document, *link));
    }
    fz_drop_link(ctx, first);
    return links;
}

std::vector<OutlineEntry> readOutline(fz_context* ctx, fz_document* document) {
    fz_outline* root = nullptr;
    std::vector<OutlineEntry> entries;
    callFitz(ctx, [&] { root = fz_load_outline(ctx, document); });
    std::vector<const fz_outline*> waiting; // one for each level
    if (root) {
        waiting.push_back(root);
    }
    while (!waiting.empty() && entries.size() < maxEntries) {
        const fz_outline* entry = waiting.back();
        if (!entry) {
            waiting.pop_back();
            continue;
        }
        waiting.back() = entry->next;
        const int level = static_cast<int>(waiting.size()) - 1;
        entries.push_back(
            {entry->title ? entry->title : "", findPage(ctx, document, *entry), level});
        waiting.push_back(entry->down);
    }
    fz_drop_outline(ctx, root);
    return entries;
}

} // namespace DrawmereConvert
