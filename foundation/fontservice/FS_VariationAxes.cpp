#include "foundation/fontservice/FS_VariationAxes.h"

#include <algorithm>
#include <cmath>
#include <span>

namespace MoxFontService_NS {

namespace {

constexpr FT_ULong weightTag = FT_MAKE_TAG('w', 'g', 'h', 't');
constexpr FT_ULong widthTag = FT_MAKE_TAG('w', 'd', 't', 'h');
constexpr FT_ULong italicTag = FT_MAKE_TAG('i', 't', 'a', 'l');
constexpr FT_ULong slantTag = FT_MAKE_TAG('s', 'l', 'n', 't');

constexpr double fixedOne = 65536.0;

double toDouble(FT_Fixed value) { return static_cast<double>(value) / fixedOne; }

int toWeight(FT_Fixed value) {
    constexpr long mostWeight = 1000;
    return static_cast<int>(std::clamp(std::lround(toDouble(value)), 1L, mostWeight));
}

// Angles count against the clock, so a face that leans to the right has a negative one.
bool isSlanted(FT_Fixed angle) { return angle < 0; }

} // namespace

FS_VariationAxes::FS_VariationAxes(FT_Face fontFace) : face(fontFace) {
    if (FT_HAS_MULTIPLE_MASTERS(face) && FT_IS_SFNT(face)) {
        FT_Get_MM_Var(face, &axes);
    }
}

FS_VariationAxes::~FS_VariationAxes() {
    if (axes) {
        FT_Done_MM_Var(face->glyph->library, axes);
    }
}

bool FS_VariationAxes::apply(const FS_FaceStyle& wanted) {
    if (!axes) {
        return true;
    }
    std::vector<FT_Fixed> places = readPlaces();
    if (const FT_Var_Axis* weight = find(weightTag)) {
        set(places, *weight, wanted.weight);
    }
    if (const FT_Var_Axis* width = find(widthTag)) {
        set(places, *width, widthPercentOf(wanted.widthClass));
    }
    if (wanted.italic) {
        setItalic(places);
    }
    return FT_Set_Var_Design_Coordinates(face, axes->num_axis, places.data()) == 0;
}

void FS_VariationAxes::readStyle(FS_FaceStyle& style) const {
    if (!axes) {
        return;
    }
    const std::vector<FT_Fixed> places = readPlaces();
    if (const FT_Var_Axis* weight = find(weightTag)) {
        style.weight = toWeight(places[weight - axes->axis]);
    }
    if (const FT_Var_Axis* width = find(widthTag)) {
        style.widthClass = widthClassOf(toDouble(places[width - axes->axis]));
    }
    if (const FT_Var_Axis* italic = find(italicTag)) {
        constexpr double half = 0.5;
        style.italic = style.italic || toDouble(places[italic - axes->axis]) >= half;
    }
    if (const FT_Var_Axis* slant = find(slantTag)) {
        style.italic = style.italic || isSlanted(places[slant - axes->axis]);
    }
}

FS_StyleRange FS_VariationAxes::readRange(const FS_FaceStyle& style) const {
    FS_StyleRange range = {style, style};
    if (const FT_Var_Axis* weight = axes ? find(weightTag) : nullptr) {
        range.least.weight = toWeight(weight->minimum);
        range.most.weight = toWeight(weight->maximum);
    }
    if (const FT_Var_Axis* width = axes ? find(widthTag) : nullptr) {
        range.least.widthClass = widthClassOf(toDouble(width->minimum));
        range.most.widthClass = widthClassOf(toDouble(width->maximum));
    }
    const FT_Var_Axis* slant = axes ? find(slantTag) : nullptr;
    range.most.italic =
        style.italic || (slant && isSlanted(slant->minimum)) || (axes && find(italicTag));
    return range;
}

const FT_Var_Axis* FS_VariationAxes::find(FT_ULong tag) const {
    const std::span<const FT_Var_Axis> all(axes->axis, axes->num_axis);
    const auto found = std::ranges::find(all, tag, &FT_Var_Axis::tag);
    return found == all.end() ? nullptr : &*found;
}

void FS_VariationAxes::set(std::vector<FT_Fixed>& places, const FT_Var_Axis& axis,
                           double value) const {
    const FT_Fixed place = std::lround(value * fixedOne);
    places[&axis - axes->axis] = std::max(axis.minimum, std::min(place, axis.maximum));
}

void FS_VariationAxes::setItalic(std::vector<FT_Fixed>& places) const {
    if (const FT_Var_Axis* italic = find(italicTag)) {
        places[italic - axes->axis] = italic->maximum;
    } else if (const FT_Var_Axis* slant = find(slantTag)) {
        places[slant - axes->axis] = slant->minimum;
    }
}

std::vector<FT_Fixed> FS_VariationAxes::readPlaces() const {
    std::vector<FT_Fixed> places(axes->num_axis);
    if (FT_Get_Var_Design_Coordinates(face, axes->num_axis, places.data()) != 0) {
        std::transform(axes->axis, axes->axis + axes->num_axis, places.begin(),
                       [](const FT_Var_Axis& axis) { return axis.def; });
    }
    return places;
}

} // namespace MoxFontService_NS
