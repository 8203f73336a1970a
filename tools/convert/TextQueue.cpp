#include "tools/convert/TextQueue.h"

#include <algorithm>
#include <utility>

namespace DrawmereConvert {
namespace {

constexpr std::size_t maxTexts = 8;
constexpr std::size_t maxTextPoints = 100000; // no viewer likes endless paths

} // namespace

template <class Test> TextQueue::Texts TextQueue::takeIf(const Test& test) {
    Texts taken;
    for (std::size_t i = 0; i < texts.size();) {
        if (test(texts[i])) {
            taken.push_back(std::move(texts[i]));
            texts.erase(texts.begin() + static_cast<std::ptrdiff_t>(i));
        } else {
            ++i;
        }
    }
    return taken;
}

TextQueue::Texts TextQueue::add(const GlyphRun& run, const Paint& paint, bool joins) {
    const auto accepts = [&](const FilledText& text) {
        return joins && text.joins && text.paint == paint && text.run.accepts(run.getStep()) &&
               text.run.countPoints() < maxTextPoints;
    };
    Texts before =
        takeIf([&](const FilledText& text) { return !accepts(text) && text.run.touches(run); });
    auto place = std::find_if(texts.begin(), texts.end(), accepts);
    if (place == texts.end()) {
        if (texts.size() == maxTexts) {
            before.push_back(std::move(texts.front()));
            texts.erase(texts.begin());
        }
        place = texts.insert(texts.end(), FilledText{{}, paint, joins});
    }
    place->run.append(run);
    return before;
}

TextQueue::Texts TextQueue::takeTouching(const fz_rect& area) {
    return takeIf([&](const FilledText& text) { return text.run.touches(area); });
}

std::optional<FilledText> TextQueue::takeEqual(const PathData& path) {
    const auto isEqual = [&](const FilledText& text) {
        const std::size_t points = text.run.countPoints();
        if (path.points.size() < points || path.points.size() > 2 * points) {
            return false;
        }
        PathData outlines;
        text.run.appendTo(outlines);
        return outlines == path;
    };
    const auto found = std::find_if(texts.begin(), texts.end(), isEqual);
    if (found == texts.end()) {
        return std::nullopt;
    }
    FilledText text = std::move(*found);
    texts.erase(found);
    return text;
}

TextQueue::Texts TextQueue::takeAll() { return std::exchange(texts, {}); }

} // namespace DrawmereConvert
