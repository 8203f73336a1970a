#include "bench/peers/Workload.h"

#include "bench/BenchSource.h"

#include <algorithm>

namespace DrawmereNS {
namespace {

constexpr std::size_t rectCount = 200'000;
constexpr std::size_t pathCount = 50'000;
constexpr std::size_t textCount = 100'000;
constexpr std::size_t stateCount = 100'000;
constexpr std::size_t documentCount = 200;
constexpr std::size_t placeCount = 20;
constexpr std::size_t segmentsOfPath = 40;
constexpr std::size_t rectsOfOneColor = 10;
constexpr std::size_t runsOfOneFont = 5;
constexpr std::array<int, 3> fontSizes = {8, 10, 13};
constexpr std::uint32_t textColor = 0x1A2B5E;
constexpr float pathWidth = 0.75F;
constexpr PenPaint fillAndStroke = {.fill = true, .stroke = true};
constexpr PenPaint strokeOnly = {.fill = false, .stroke = true};

PenBox takeBox(BenchSource& source) {
    const BenchRect rect = source.takeRect(0);
    return {rect.x, rect.y, rect.width, rect.height};
}

void drawPath(Pen& pen, BenchSource& source) {
    BenchPoint current = {source.takeBelow(595), source.takeBelow(842)};
    pen.startPath(current);
    for (std::size_t i = 0; i < segmentsOfPath; ++i) {
        if (i % 2 == 0) {
            current = source.takeNear(current);
            pen.lineTo(current);
        } else {
            const BenchPoint control1 = source.takeNear(current);
            const BenchPoint control2 = source.takeNear(current);
            current = source.takeNear(current);
            pen.curveTo({true, control1, control2, current});
        }
    }
    pen.strokePath();
}

/// Runs of text, counted on from one call to the next.
class TextSource {
public:
    explicit TextSource(BenchSource& numbers) : source(numbers) {}

    void draw(Pen& pen) {
        if (count % runsOfOneFont == 0) {
            const std::size_t change = count / runsOfOneFont;
            pen.setFont(change % penFamilies.size(), fontSizes[change % fontSizes.size()]);
        }
        ++count;
        makeWords();
        const float x = source.takeBelow(480);
        pen.drawText(run, x, 20.0F + source.takeBelow(800));
    }

private:
    /// 10 to 14 characters, with single blanks between letters.
    void makeWords() {
        constexpr unsigned int least = 10;
        constexpr unsigned int spread = 5;
        const std::size_t length = least + source.takeCount(spread);
        run.bytes.clear();
        while (run.bytes.size() < length) {
            const char letter = source.takeLetter();
            const bool fits =
                !run.bytes.empty() && run.bytes.back() != ' ' && run.bytes.size() + 1 < length;
            run.bytes += letter == ' ' && !fits ? 'n' : letter;
        }
        run.text = UnicodeString::fromUTF8(run.bytes);
    }

    BenchSource& source;
    PenText run;
    std::size_t count = 0;
};

void drawRects(Pen& pen, const WorkloadInput& input) {
    BenchSource source;
    pen.startDocument(1);
    pen.setStrokeColor(benchStrokeColor);
    pen.setStrokeWidth(1);
    for (std::size_t i = 0; i < rectCount / input.divisor; ++i) {
        if (i % rectsOfOneColor == 0) {
            pen.setFillColor(source.takeColor());
        }
        pen.drawRect(takeBox(source), fillAndStroke);
    }
    pen.finishDocument();
}

void drawPaths(Pen& pen, const WorkloadInput& input) {
    BenchSource source;
    pen.startDocument(1);
    pen.setStrokeColor(benchStrokeColor);
    pen.setStrokeWidth(pathWidth);
    for (std::size_t i = 0; i < pathCount / input.divisor; ++i) {
        drawPath(pen, source);
    }
    pen.finishDocument();
}

void drawTexts(Pen& pen, const WorkloadInput& input) {
    BenchSource source;
    TextSource texts(source);
    pen.startDocument(1);
    pen.setFillColor(textColor);
    for (std::size_t i = 0; i < textCount / input.divisor; ++i) {
        texts.draw(pen);
    }
    pen.finishDocument();
}

/// Each round turns and stretches the page around the corner of its rectangle.
void drawStates(Pen& pen, const WorkloadInput& input) {
    BenchSource source;
    pen.startDocument(1);
    pen.setStrokeColor(benchStrokeColor);
    for (std::size_t i = 0; i < stateCount / input.divisor; ++i) {
        const BenchRect rect = source.takeRect(0);
        pen.pushState();
        const float a = 0.5F + source.takeBelow(1);
        const float b = 0.1F + source.takeBelow(1);
        pen.setMatrix({a, b, -b, a, rect.x, rect.y});
        pen.setStrokeWidth(rect.strokeWidth);
        pen.drawRect({1, 2, rect.width, rect.height}, strokeOnly);
        pen.popState();
    }
    pen.finishDocument();
}

/// Draws a part of a mixed page: five rectangles, five paths and thirty runs of text. Three of the
/// ten parts clip their rectangles, two have a gradient.
void drawPart(Pen& pen, BenchSource& source, TextSource& texts, std::size_t part) {
    constexpr std::size_t shapeCount = 5;
    constexpr std::size_t runCount = 30;
    const bool isClipped = part % 3 == 1 && part < 9;
    pen.setFillColor(source.takeColor());
    if (isClipped) {
        pen.pushState();
        pen.clip({20, 20, 300, 400});
    }
    for (std::size_t i = 0; i < shapeCount; ++i) {
        pen.drawRect(takeBox(source), fillAndStroke);
    }
    if (isClipped) {
        pen.popState();
    }
    if (part % 5 == 3) {
        pen.drawGradient(takeBox(source), source.takeColor(), benchStrokeColor);
    }
    for (std::size_t i = 0; i < shapeCount; ++i) {
        drawPath(pen, source);
    }
    pen.setFillColor(textColor);
    for (std::size_t i = 0; i < runCount; ++i) {
        texts.draw(pen);
    }
}

void drawPage(Pen& pen, BenchSource& source) {
    constexpr std::size_t partCount = 10;
    TextSource texts(source);
    pen.setStrokeColor(benchStrokeColor);
    pen.setStrokeWidth(pathWidth);
    for (std::size_t part = 0; part < partCount; ++part) {
        drawPart(pen, source, texts, part);
    }
}

std::size_t countPages(const WorkloadInput& input) {
    return std::max<std::size_t>(1, documentCount / input.divisor);
}

void drawMixed(Pen& pen, const WorkloadInput& input) {
    BenchSource source;
    for (std::size_t i = 1; i <= countPages(input); ++i) {
        pen.startDocument(static_cast<int>(i));
        drawPage(pen, source);
        pen.finishDocument();
    }
}

void drawMixedOnce(Pen& pen, const WorkloadInput& input) {
    BenchSource source;
    pen.startDocument(1);
    for (std::size_t i = 0; i < countPages(input); ++i) {
        drawPage(pen, source);
    }
    pen.finishDocument();
}

PenBox findPlace(std::size_t i) {
    constexpr std::size_t columns = 5;
    const std::size_t row = i / columns;
    return {static_cast<float>(i % columns) * 110.0F, static_cast<float>(row) * 90.0F, 100.0F,
            80.0F};
}

void drawImages(Pen& pen, const WorkloadInput& input) {
    pen.startDocument(1);
    for (std::size_t i = 0; i < input.images.size(); ++i) {
        pen.drawImage(input.images[i], findPlace(i));
    }
    pen.finishDocument();
}

void drawOneImage(Pen& pen, const WorkloadInput& input) {
    pen.startDocument(1);
    for (std::size_t i = 0; i < placeCount && !input.images.empty(); ++i) {
        pen.drawImage(input.images.front(), findPlace(i));
    }
    pen.finishDocument();
}

void drawNothing(Pen& pen, const WorkloadInput& /*input*/) {
    pen.startDocument(1);
    pen.finishDocument();
}

struct Workload {
    const char* name;
    void (*draw)(Pen& pen, const WorkloadInput& input);
};

constexpr Workload workloads[] = {
    {"empty", drawNothing},    {"rects", drawRects},   {"paths", drawPaths},
    {"text", drawTexts},       {"state", drawStates},  {"mixed", drawMixed},
    {"mixed1", drawMixedOnce}, {"images", drawImages}, {"imagesdup", drawOneImage},
};

} // namespace

bool drawWorkload(const std::string& name, Pen& pen, const WorkloadInput& input) {
    const auto* const found = std::ranges::find(workloads, name, &Workload::name);
    if (found == std::end(workloads)) {
        return false;
    }
    found->draw(pen, input);
    return true;
}

} // namespace DrawmereNS
