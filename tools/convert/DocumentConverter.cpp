#include "tools/convert/DocumentConverter.h"

#include "tools/convert/DocumentFile.h"
#include "tools/convert/GlyphOutlines.h"
#include "tools/convert/PageDevice.h"
#include "tools/convert/PagePainter.h"

#include <utility>

namespace DrawmereConvert {
namespace {

PageSize getSize(const fz_rect& bounds) { return {bounds.x1 - bounds.x0, bounds.y1 - bounds.y0}; }

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
      outlines(std::make_unique<GlyphOutlines>(file->ctx)) {}

DocumentConverter::~DocumentConverter() = default;

void DocumentConverter::open(const std::string& path, const std::string& password) {
    file->open(path, password);
}

int DocumentConverter::getPageCount() const { return file->pageCount; }

std::string DocumentConverter::getTitle() const { return {}; }

std::vector<OutlineEntry> DocumentConverter::getOutline() const { return {}; }

void DocumentConverter::findDestinations(PageTargets& targets) {
    targets.destinations.resize(targets.files.size());
}

PageSize DocumentConverter::loadPage(int page) {
    outlines->trim();
    file->loadPage(page);
    return getSize(file->pageBounds);
}

PageReport DocumentConverter::drawPage(const PagePlace& place, const PageTargets& /*targets*/,
                                       Drawmere& drawmere) {
    const fz_rect& bounds = file->pageBounds;
    const PageSize size = getSize(bounds);
    const float bottom = place.offset + size.height;
    drawmere.startPage(place.number, {pt(0), pt(place.offset), pt(size.width), pt(bottom)});
    if (place.isSingle) {
        drawmere.setCanvasSize(pt(size.width), pt(size.height));
    }
    PageReport report;
    PagePainter painter(file->ctx, options, *outlines, report, drawmere,
                        {0, place.offset, size.width, bottom});
    report.isComplete = runPage(*file, painter, fz_translate(-bounds.x0, place.offset - bounds.y0));
    if (painter.failure) {
        std::rethrow_exception(painter.failure);
    }
    painter.finish();
    drawmere.endPage();
    report.isComplete = report.isComplete && file->cookie.errors == 0;
    report.messages = std::exchange(file->messages, {});
    return report;
}

void DocumentConverter::cancel() { file->cookie.abort = 1; }

} // namespace DrawmereConvert
