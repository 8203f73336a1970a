#include "foundation/fontservice/FS_FaceStyle.h"

#include <algorithm>
#include <cmath>
#include <compare>
#include <iterator>

namespace MoxFontService_NS {

namespace {

constexpr int mostWeight = 1000;

struct WidthRow {
    double percent;
    const char16_t* word;
};

// By width class, from 1 on.
constexpr WidthRow widthRows[] = {
    {50.0, u"Ultra Condensed"},
    {62.5, u"Extra Condensed"},
    {75.0, u"Condensed"},
    {87.5, u"Semi Condensed"},
    {100.0, u""},
    {112.5, u"Semi Expanded"},
    {125.0, u"Expanded"},
    {150.0, u"Extra Expanded"},
    {200.0, u"Ultra Expanded"},
};

constexpr int widthCount = static_cast<int>(std::size(widthRows));
static_assert(widthCount == 9);

// Added to a distance in the direction that is tried last, and last of all.
constexpr int secondChoice = 10'000;
constexpr int thirdChoice = 20'000;

// The members in the order in which they decide.
struct Distance {
    int width;
    int slant;
    int weight;

    auto operator<=>(const Distance&) const = default;
};

const WidthRow& findWidth(int widthClass) {
    return widthRows[std::clamp(widthClass, 1, widthCount) - 1];
}

// A width up to the normal one looks among the narrower ones first, a wider one among the wider.
int measureWidth(const FS_StyleRange& font, int wanted) {
    const int nearest = std::max(font.least.widthClass, std::min(wanted, font.most.widthClass));
    const bool firstDirection =
        wanted <= FS_FaceStyle::normalWidth ? nearest <= wanted : nearest >= wanted;
    return std::abs(nearest - wanted) + (firstDirection ? 0 : secondChoice);
}

int measureSlant(const FS_StyleRange& font, bool wanted) {
    return font.least.italic == wanted || font.most.italic == wanted ? 0 : 1;
}

// Weights from 400 to 500 look up to 500, then down, then up. Lighter ones look down first, bolder
// ones up.
int measureWeight(const FS_StyleRange& font, int wanted) {
    constexpr int mostMedium = 500;
    const int nearest = std::max(font.least.weight, std::min(wanted, font.most.weight));
    const int steps = std::abs(nearest - wanted);
    if (wanted > mostMedium) {
        return steps + (nearest >= wanted ? 0 : secondChoice);
    }
    if (nearest <= wanted) {
        return steps + (wanted < FS_FaceStyle::normalWeight || steps == 0 ? 0 : secondChoice);
    }
    if (wanted < FS_FaceStyle::normalWeight) {
        return steps + secondChoice;
    }
    return steps + (nearest <= mostMedium ? 0 : thirdChoice);
}

Distance measure(const FS_StyleRange& font, const FS_FaceStyle& wanted) {
    return {measureWidth(font, wanted.widthClass), measureSlant(font, wanted.italic),
            measureWeight(font, wanted.weight)};
}

} // namespace

FS_FaceStyle makeStyle(int weight, bool italic, int widthClass) {
    FS_FaceStyle style;
    style.italic = italic;
    if (weight >= 1 && weight <= mostWeight) {
        style.weight = weight;
    }
    if (widthClass >= 1 && widthClass <= widthCount) {
        style.widthClass = widthClass;
    }
    return style;
}

double widthPercentOf(int widthClass) { return findWidth(widthClass).percent; }

int widthClassOf(double percent) {
    const auto* nearest = std::ranges::min_element(
        widthRows, {}, [percent](const WidthRow& row) { return std::abs(row.percent - percent); });
    return static_cast<int>(nearest - std::begin(widthRows)) + 1;
}

const char16_t* widthWordOf(int widthClass) { return findWidth(widthClass).word; }

int chooseFont(std::span<const FS_StyleRange> fonts, const FS_FaceStyle& wanted) {
    const auto chosen = std::ranges::min_element(
        fonts, {}, [&wanted](const FS_StyleRange& font) { return measure(font, wanted); });
    return static_cast<int>(chosen - fonts.begin());
}

} // namespace MoxFontService_NS
