#include "tools/convert/DocumentConverter.h"

#include "tools/convert/DocumentFile.h"
#include "tools/convert/GlyphOutlines.h"
#include "tools/convert/LinkReader.h"
#include "tools/convert/LinkWriter.h"
#include "tools/convert/PageDevice.h"
#include "tools/convert/PagePainter.h"
#include "tools/convert/TextFont.h"

#include <mupdf/pdf.h>

#include <algorithm>
#include <utility>

namespace DrawmereConvert {
namespace {

PageSize getSize(const fz_rect& bounds) { return {bounds.x1 - bounds.x0, bounds.y1 - bounds.y0}; }

bool usesOverprint(const DocumentFile& file) {
    fz_context* ctx = file.ctx;
    fz_page* page = file.page;
    bool uses = false;
    callFitz(ctx, [&] { uses = fz_page_uses_overprint(ctx, page) != 0; });
    return uses;
}

/// Runs the page through a device. Returns: false when MuPDF gave it up.
bool runPage(DocumentFile& file, PagePainter& painter, const fz_matrix& matrix) {
    fz_context* ctx = file.ctx;
    fz_device* device = nullptr;
    fz_var(device);
    bool done = false;
    fz_var(done);
    fz_try(ctx) {
        device = makePageDevice(ctx, &painter);
        fz_run_page(ctx, file.page, device, matrix, &file.cookie);
        fz_close_device(ctx, device);
        done = true;
    }
    fz_always(ctx) { fz_drop_device(ctx, device); }
    fz_catch(ctx) { done = false; }
    return done;
}

} // namespace

DocumentConverter::DocumentConverter(const ConvertOptions& chosen)
    : options(chosen), file(std::make_unique<DocumentFile>(chosen)),
      outlines(std::make_unique<GlyphOutlines>(file->ctx, chosen.precision)),
      fonts(std::make_unique<FontBook>(file->ctx)) {}

DocumentConverter::~DocumentConverter() = default;

void DocumentConverter::open(const std::string& path, const std::string& password) {
    file->open(path, password);
}

void DocumentConverter::link(const std::string& path, const std::string& reference) {
    options.linkFile = path;
    options.linkReference = reference;
}

int DocumentConverter::getPageCount() const { return file->pageCount; }

std::string DocumentConverter::getTitle() const {
    char title[256] = "";
    fz_context* ctx = file->ctx;
    fz_document* document = file->document;
    const bool isKnown = callFitz(
        ctx, [&] { fz_lookup_metadata(ctx, document, FZ_META_INFO_TITLE, title, sizeof title); });
    return isKnown ? title : "";
}

std::string DocumentConverter::getLanguage() const {
    char language[8] = "";
    fz_context* ctx = file->ctx;
    fz_document* document = file->document;
    const bool isKnown = callFitz(ctx, [&] {
        if (pdf_document* const pdf = pdf_specifics(ctx, document)) {
            fz_string_from_text_language(language, pdf_document_language(ctx, pdf));
        }
    });
    return isKnown ? language : "";
}

std::vector<OutlineEntry> DocumentConverter::getOutline() const {
    return readOutline(file->ctx, file->document);
}

void DocumentConverter::findDestinations(PageTargets& targets) {
    targets.destinations.assign(targets.files.size(), {});
    for (std::size_t page = 0; page < targets.files.size(); ++page) {
        if (!targets.files[page].isEmpty()) {
            findDestinationsOf(static_cast<int>(page), targets);
        }
    }
}

void DocumentConverter::findDestinationsOf(int page, PageTargets& targets) {
    try {
        file->loadPage(page);
    } catch (const ConvertError&) {
        return; // said when it is to be drawn
    }
    for (const PageLink& link : readLinks(file->ctx, file->document, file->page)) {
        const bool isWhole = link.destination.id.isEmpty();
        if (link.page < 0 || link.page >= static_cast<int>(targets.destinations.size()) ||
            (isWhole && !targets.singleFile)) {
            continue;
        }
        const LinkDestination destination =
            isWhole ? makePageDestination(link.page) : link.destination;
        auto& known = targets.destinations[static_cast<std::size_t>(link.page)];
        const bool isKnown = std::ranges::any_of(
            known, [&](const LinkDestination& other) { return other.id == destination.id; });
        if (!isKnown) {
            known.push_back(destination);
        }
    }
}

PageSize DocumentConverter::loadPage(int page) {
    outlines->trim();
    currentPage = page;
    file->loadPage(page);
    return getSize(file->pageBounds);
}

PageReport DocumentConverter::drawPage(const PagePlace& place, const PageTargets& targets,
                                       Drawmere& drawmere) {
    const fz_rect& bounds = file->pageBounds;
    const PageSize size = getSize(bounds);
    const float bottom = place.offset + size.height;
    drawmere.startPage(place.number, {pt(0), pt(place.offset), pt(size.width), pt(bottom)});
    if (place.isSingle) {
        fonts->startDocument();
        drawmere.setCanvasSize(pt(size.width), pt(size.height));
    }
    PageReport report;
    const fz_matrix matrix = fz_translate(-bounds.x0, place.offset - bounds.y0);
    PagePainter painter(file->ctx, options, *outlines, *fonts, report, drawmere,
                        {0, place.offset, size.width, bottom},
                        [&](GroupScan& scan) { scan.run(file->ctx, file->page, matrix); },
                        {file->page, matrix, &file->cookie});
    if (!place.isSingle) {
        painter.clipToPage();
    }
    const bool isRead = runPage(*file, painter, matrix);
    if (painter.failure) {
        std::rethrow_exception(painter.failure);
    }
    painter.finish();
    LinkWriter links(painter.canvas, targets, currentPage, {-bounds.x0, place.offset - bounds.y0});
    links.writeLinks(readLinks(file->ctx, file->document, file->page), report);
    links.writeDestinations();
    drawmere.endPage();
    report.isComplete = report.isComplete && isRead && file->cookie.errors == 0;
    report.messages = std::exchange(file->messages, {});
    if (painter.canvas.getElementCount() > options.maxShapes) {
        report.note(APPROXIMATION_LIMIT);
    }
    if (usesOverprint(*file)) {
        report.note(APPROXIMATION_OVERPRINT);
    }
    return report;
}

void DocumentConverter::cancel() { file->cookie.abort = 1; }

} // namespace DrawmereConvert
