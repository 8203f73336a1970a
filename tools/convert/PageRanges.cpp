#include "tools/convert/PageRanges.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <stdexcept>

namespace DrawmereConvert {
namespace {

/// Returns: the number that is all of `text`, `missing` for an empty one.
int readNumber(const std::string& text, int missing) {
    if (text.empty()) {
        return missing;
    }
    int number = 0;
    const char* const end = text.data() + text.size();
    const auto [stop, failure] = std::from_chars(text.data(), end, number);
    if (failure != std::errc() || stop != end || number < 1) {
        throw std::invalid_argument("\"" + text + "\" is no page number");
    }
    return number;
}

} // namespace

PageRanges::PageRanges(const std::string& text) {
    std::size_t begin = 0;
    while (begin <= text.size()) {
        const std::size_t end = std::min(text.find(',', begin), text.size());
        ranges.push_back(readRange(text.substr(begin, end - begin)));
        begin = end + 1;
    }
}

PageRanges::Range PageRanges::readRange(const std::string& part) {
    constexpr int open = std::numeric_limits<int>::max();
    const std::size_t dash = part.find('-');
    if (part.empty() || part == "-") {
        throw std::invalid_argument("a page number is missing");
    }
    if (dash == std::string::npos) {
        const int number = readNumber(part, 1);
        return {number, number};
    }
    const Range range = {readNumber(part.substr(0, dash), 1),
                         readNumber(part.substr(dash + 1), open)};
    if (range.first > range.last) {
        throw std::invalid_argument("the range \"" + part + "\" runs backwards");
    }
    return range;
}

std::vector<int> PageRanges::select(int pageCount) const {
    std::vector<int> pages;
    for (int page = 0; page < pageCount; ++page) {
        if (ranges.empty() || holds(page + 1)) {
            pages.push_back(page);
        }
    }
    return pages;
}

bool PageRanges::holds(int number) const {
    return std::ranges::any_of(ranges, [number](const Range& range) {
        return range.first <= number && number <= range.last;
    });
}

} // namespace DrawmereConvert
