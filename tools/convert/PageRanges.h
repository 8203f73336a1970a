/// Which pages of a document are converted.
#pragma once

#include <string>
#include <vector>

namespace DrawmereConvert {

/// Ranges of page numbers as a reader writes them: "1-5,8,12-".
class PageRanges {
public:
    /// Makes the ranges that hold every page.
    PageRanges() = default;

    /// Shape: `text`, numbers from 1 and ranges of them, with commas between; a range may lack its
    /// first or its last number. Throws: std::invalid_argument for any other text.
    explicit PageRanges(const std::string& text);

    /// Returns: the pages of a document of `pageCount` pages that are in a range, counted from 0,
    /// in the order of the document and each once.
    std::vector<int> select(int pageCount) const;

private:
    struct Range {
        int first;
        int last;
    };

    static Range readRange(const std::string& part);
    bool holds(int number) const;

    std::vector<Range> ranges; // none for every page
};

} // namespace DrawmereConvert
