/// What became of a page.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace DrawmereConvert {

/// What SVG 1.1 or the chosen options can't say exactly.
enum APPROXIMATION : std::int32_t {
    APPROXIMATION_BLEND = 0, ///< drawn without its blend mode
    APPROXIMATION_MIXTURE,   ///< a group with a blend mode drawn as an image
    APPROXIMATION_KNOCKOUT,  ///< a knockout group drawn as a plain one
    APPROXIMATION_OVERPRINT, ///< drawn without overprint
    APPROXIMATION_MASK,      ///< a mask put on parts one by one, or left out
    APPROXIMATION_SHADING,   ///< a shading drawn as an image
    APPROXIMATION_GRADIENT,  ///< a shading drawn in one colour, as the profile knows no more
    APPROXIMATION_PATTERN,   ///< a pattern whose cells overlap, cut off, or that is left out
    APPROXIMATION_IMAGE,     ///< an image decoded and written in another form
    APPROXIMATION_TEXT,      ///< text drawn as outlines though the mode asks for text
    APPROXIMATION_DEPTH,     ///< a clip or group left out where elements nest too deep
    APPROXIMATION_CLIP,      ///< something not cut, or cut straight, as the profile knows no more
    APPROXIMATION_LINK,      ///< a link left out, as there is nothing for it to lead to
    APPROXIMATION_LIMIT,     ///< written all the same, though some viewers refuse so much
    APPROXIMATION_COUNT,
};

/// Returns: the words for `count` of `kind`, for instance "2 blend modes left out".
std::string describeApproximation(APPROXIMATION kind, int count);

/// A link of the page, for what lies over pictures of pages. Units: points from the page's top
/// left.
struct LinkArea {
    float x = 0;
    float y = 0;
    float width = 0;
    float height = 0;
    std::string target; ///< UTF-8, as it is handed to `Drawmere::startLink`
};

struct PageReport {
    void note(APPROXIMATION kind) { ++approximations.at(static_cast<std::size_t>(kind)); }

    /// Adds what `other` counted and said.
    void add(const PageReport& other);

    /// Returns: the sum of all counts.
    int countApproximations() const;

    std::array<int, APPROXIMATION_COUNT> approximations{};
    bool isComplete = true;            ///< false when a part of the page is missing
    std::vector<std::string> messages; ///< errors and warnings of the parser, without repetitions
    std::vector<LinkArea> links;       ///< in the order in which they are drawn
};

} // namespace DrawmereConvert
