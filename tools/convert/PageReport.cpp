#include "tools/convert/PageReport.h"

#include <algorithm>
#include <numeric>

namespace DrawmereConvert {
namespace {

struct ApproximationWords {
    const char* one;
    const char* many;
};

constexpr std::array<ApproximationWords, APPROXIMATION_COUNT> approximationWords = {{
    {"blend mode left out", "blend modes left out"},
    {"blended group drawn as an image", "blended groups drawn as images"},
    {"knockout group drawn as a plain one", "knockout groups drawn as plain ones"},
    {"overprint left out", "overprints left out"},
    {"mask approximated", "masks approximated"},
    {"shading drawn as an image", "shadings drawn as images"},
    {"shading drawn in one colour", "shadings drawn in one colour"},
    {"pattern cut or left out", "patterns cut or left out"},
    {"image written in another form", "images written in another form"},
    {"text drawn as outlines", "texts drawn as outlines"},
    {"clip or group too deep", "clips or groups too deep"},
    {"clip left out or widened", "clips left out or widened"},
    {"link left out", "links left out"},
    {"thing too large for some viewers", "things too large for some viewers"},
}};

} // namespace

std::string describeApproximation(APPROXIMATION kind, int count) {
    const ApproximationWords& words = approximationWords.at(static_cast<std::size_t>(kind));
    return std::to_string(count) + " " + (count == 1 ? words.one : words.many);
}

void PageReport::add(const PageReport& other) {
    for (std::size_t i = 0; i < approximations.size(); ++i) {
        approximations.at(i) += other.approximations.at(i);
    }
    isComplete = isComplete && other.isComplete;
    for (const std::string& message : other.messages) {
        if (std::ranges::find(messages, message) == messages.end()) {
            messages.push_back(message);
        }
    }
}

int PageReport::countApproximations() const {
    return std::accumulate(approximations.begin(), approximations.end(), 0);
}

} // namespace DrawmereConvert
