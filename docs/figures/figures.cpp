// The two pictures of architecture.md: the folders, and the way of a drawing call.
// Usage: figures [DIRECTORY/]

#include "Drawmere.h"

#include <cstdio>
#include <vector>

using namespace DrawmereNS;

namespace {

// All numbers are points, y grows downwards and is that of a baseline for texts.
constexpr float width = 720;
constexpr float margin = 20;

const MoxColor paper(0xFBFAF7);
const MoxColor edge(0xD5D0C4);
const MoxColor ink(0x22262E);
const MoxColor soft(0x5F6672);
const MoxColor sea(0x1F5F7A);
const MoxColor seaTint(0xDCEAF0);
const MoxColor sandTint(0xF3E8CF);
const MoxColor leafTint(0xDFEBDD);
const MoxColor roseTint(0xF1DFDC);

MoxLength pt(float number) { return MoxLength(number, MoxCommonNS::MOXUNIT_POINT); }

struct Area {
    float x;
    float y;
    float width;
    float height;

    float middle() const { return x + width / 2; }

    float right() const { return x + width; }

    float bottom() const { return y + height; }
};

struct Type {
    float size;
    MoxColor color;
    FONTWEIGHT weight = FONTWEIGHT_NORMAL;
    const char16_t* family = u"sans-serif"; ///< looks right wherever the picture is shown
};

const Type title{18, ink, FONTWEIGHT_BOLD};
const Type name{14, ink, FONTWEIGHT_BOLD};
const Type note{11, soft};
const Type code{10.5F, sea, FONTWEIGHT_NORMAL, u"monospace"};

void drawText(Drawmere& page, const Type& type, const UnicodeString& text, float x, float y,
              TEXTANCHOR anchor = TEXTANCHOR_START) {
    SVGFont font;
    font.setFontAttribute(type.family, pt(type.size), type.weight, FSTYLE_NORMAL, u"", false);
    page.setFont(&font, nullptr);
    page.setFillColor(type.color);
    page.setTextAnchor(anchor);
    page.drawText(text, pt(x), pt(y), PAINTMODE_FILL, nullptr, /*wholeRun=*/true,
                  /*leftToRight=*/true);
}

void drawBox(Drawmere& page, const Area& area, const MoxColor& fill) {
    page.setFillColor(fill);
    page.setStrokeColor(edge);
    page.drawRect(pt(area.x), pt(area.y), pt(area.width), pt(area.height), pt(6), pt(6),
                  PAINTMODE_FILLSTROKE);
}

/// Draws a line down from one place to another, with a head at its end.
void drawArrow(Drawmere& page, float x, float from, float to) {
    page.setStrokeColor(soft);
    page.setFillColor(soft);
    page.drawLine(pt(x), pt(from), pt(x), pt(to - 6), PAINTMODE_STROKE);
    float head[] = {x - 4, to - 7, x + 4, to - 7, x, to};
    page.drawPolygon(head, 6, PAINTMODE_FILL);
}

// The folders: each box may use what lies below it.

struct Folder {
    const char16_t* name;
    const char16_t* note;
    const char16_t* more = u"";
};

struct Layer {
    std::vector<Folder> folders;
    MoxColor color;
};

const std::vector<Layer>& getLayers() {
    static const std::vector<Layer> layers = {
        {{{u"tools/convert/", u"documents in, SVG pages out"},
          {u"examples/, bench/", u"callers of the library"}},
         roseTint},
        {{{u"frontend/", u"the public class, its life cycle, errors"}}, seaTint},
        {{{u"draw/", u"an element for each call; the output profiles"}}, seaTint},
        {{{u"path/", u"segments,", u"number rule"},
          {u"fonts/", u"fonts in the", u"document"},
          {u"images/", u"embed, copy,", u"refer"},
          {u"post/", u"passes over a", u"finished tree"}},
         leafTint},
        {{{u"tree/", u"the document, the cursor"},
          {u"state/", u"graphic state, groups, matrices"},
          {u"refs/", u"ids and links"}},
         leafTint},
        {{{u"config/", u"options, output files, compressed output"}}, leafTint},
        {{{u"include/", u"the public headers"},
          {u"foundation/", u"DOM, XML writer, values, URIs;", u"faces, raster images"}},
         sandTint},
    };
    return layers;
}

constexpr float layerHeight = 58;
constexpr float layerStep = layerHeight + 22;
constexpr float gap = 12;

void drawFolder(Drawmere& page, const Folder& folder, const Area& area, const MoxColor& color) {
    const bool hasMore = folder.more[0] != u'\0';
    drawBox(page, area, color);
    const float y = area.y + (hasMore ? 20.0F : 26.0F);
    drawText(page, name, folder.name, area.middle(), y, TEXTANCHOR_MIDDLE);
    drawText(page, note, folder.note, area.middle(), y + 16, TEXTANCHOR_MIDDLE);
    if (hasMore) {
        drawText(page, note, folder.more, area.middle(), y + 30, TEXTANCHOR_MIDDLE);
    }
}

void drawLayer(Drawmere& page, const Layer& layer, float y) {
    const auto count = static_cast<float>(layer.folders.size());
    const float boxWidth = (width - 2 * margin - gap * (count - 1)) / count;
    Area area{margin, y, boxWidth, layerHeight};
    for (const Folder& folder : layer.folders) {
        drawFolder(page, folder, area, layer.color);
        area.x = area.right() + gap;
    }
}

float getFoldersHeight() { return 64 + layerStep * static_cast<float>(getLayers().size()); }

void drawFolders(Drawmere& page) {
    drawText(page, title, u"Folders: each uses what lies below it", margin, 34);
    float y = 54;
    for (const Layer& layer : getLayers()) {
        if (y > 54) {
            drawArrow(page, width / 2, y - layerStep + layerHeight + 3, y - 3);
        }
        drawLayer(page, layer, y);
        y += layerStep;
    }
    drawText(page, note,
             u"tree/ and state/ know each other, and so do include/ and foundation/. "
             u"tests/ mirrors the folders.",
             margin, y - 4);
}

// The way of a drawing call, in three times.

struct Step {
    const char16_t* where;
    const char16_t* what;
};

struct Time {
    const char16_t* name;
    std::vector<Step> steps;
    const char16_t* result;
    MoxColor color;
};

const std::vector<Time>& getTimes() {
    static const std::vector<Time> times = {
        {u"1. During the call",
         {{u"Drawmere::drawRect", u"the public class forwards to the document that is open"},
          {u"DrawmereImpl::drawRect", u"makes the element: x, y, width, height; fill and stroke"},
          {u"SVGGManager::setElemMode", u"another kind of element than before closes the group"},
          {u"SVGFullImpl::addElement", u"the profile may drop it; content goes to the group"},
          {u"SVGGroupManager::addElement", u"appends it to the open group, or opens one"},
          {u"SVGGraphicContext::AttrValueCompare", u"writes on it what differs from the group"}},
         u"<g> <rect x=\"20\" y=\"20\" width=\"60\" ... fill=\"red\"/> </g>, outside the tree",
         seaTint},
        {u"2. When the group closes: another kind, push, pop, a path, the end",
         {{u"SVGGroupManager::appendToTree", u"hands the group over and moves the state outwards"},
          {u"SVGTreeManager::addElement", u"hangs it below the current node of the tree"},
          {u"SVGGraphicContext::setGroupAttrs", u"writes on it what differs from the defaults"}},
         u"<svg> <g stroke-width=\"2\"> <rect .../> <rect .../> </g> </svg>",
         leafTint},
        {u"3. When the document is finished",
         {{u"SVGFontManager::doEmbedFonts", u"reads outlines and writes the fonts"},
          {u"SVGOptimizer::optimize", u"takes empty groups out"},
          {u"SVGReferenceId", u"links to pages to come? then the document waits for finish"},
          {u"MoxDocument::save", u"one pass over the tree turns numbers into text"},
          {u"SVGZipStream", u"with gzip, compresses what goes by"}},
         u"bytes in a file, or on the caller's stream",
         sandTint},
    };
    return times;
}

constexpr float stepHeight = 26;

float getTimeHeight(const Time& time) {
    return 62 + stepHeight * static_cast<float>(time.steps.size());
}

float getCallHeight() {
    float height = 52;
    for (const Time& time : getTimes()) {
        height += getTimeHeight(time) + 22;
    }
    return height;
}

void drawStep(Drawmere& page, const Step& step, float y) {
    drawBox(page, {margin + 12, y, 268, stepHeight - 5}, paper);
    drawText(page, code, step.where, margin + 20, y + 14.5F);
    drawText(page, note, step.what, margin + 294, y + 14.5F);
}

void drawTime(Drawmere& page, const Time& time, float y) {
    const Area area{margin, y, width - 2 * margin, getTimeHeight(time)};
    drawBox(page, area, time.color);
    drawText(page, name, time.name, margin + 12, y + 22);
    float stepY = y + 32;
    for (const Step& step : time.steps) {
        drawStep(page, step, stepY);
        stepY += stepHeight;
    }
    drawText(page, code, time.result, margin + 12, area.bottom() - 11);
}

void drawCall(Drawmere& page) {
    drawText(page, title, u"The way of drawRect, from the call to the bytes", margin, 34);
    float y = 54;
    for (const Time& time : getTimes()) {
        drawTime(page, time, y);
        y += getTimeHeight(time) + 22;
        if (&time != &getTimes().back()) {
            drawArrow(page, width / 2, y - 19, y - 3);
        }
    }
}

// Both on a ground of their own, so that they look the same on every page.

using Draw = void (*)(Drawmere& page);

void writePicture(const UnicodeString& path, float height, Draw draw) {
    SVGConfig config;
    config.streamOutput = false;
    config.saveOption = u"indent,decimals=2";
    SVGPageUri uri(path);
    Drawmere drawmere(&config, &uri);
    drawmere.initRootSvg(path);
    drawmere.startPage(1, MoxRectT<MoxLength>(pt(0), pt(0), pt(width), pt(height)));
    drawmere.setCanvasSize(pt(width), pt(height));
    drawBox(drawmere, {0.5F, 0.5F, width - 1, height - 1}, paper);
    draw(drawmere);
    drawmere.endPage();
    drawmere.finishRootSvg();
    drawmere.finish();
}

} // namespace

int main(int argc, char** argv) {
    const UnicodeString directory = UnicodeString::fromUTF8(argc > 1 ? argv[1] : "");
    try {
        writePicture(directory + u"folders.svg", getFoldersHeight(), drawFolders);
        writePicture(directory + u"call.svg", getCallHeight(), drawCall);
    } catch (const MoxError& error) {
        std::fprintf(stderr, "figures: %s\n", error.what());
        return 1;
    }
}
