/// Gaps between the words of a line.
#pragma once

#include "tools/convert/TextSpan.h"

#include <vector>

namespace DrawmereConvert {

/// Finds where words of a line are apart without a blank between them, as in most documents of
/// typesetting programs. Letters that are spaced out are no words.
class WordGaps {
public:
    using Clusters = std::vector<const TextSpan::Cluster*>;

    /// Shape: `clusters`, on one line, in the order of reading; `size`, of their font, in points.
    WordGaps(const Clusters& clusters, float size);

    /// Returns: how many there are.
    std::size_t size() const { return count; }

    bool isEmpty() const { return count == 0; }

    /// Returns: whether a word ends before the cluster of this index, with no blank there.
    bool isBefore(std::size_t index) const { return gaps[index].isBetweenWords; }

    /// Returns: where a blank before that cluster is, roughly, as it isn't seen.
    float findPlace(std::size_t index) const;

private:
    struct Gap {
        float start = 0;
        float width = 0;          // below 0 where glyphs overlap
        bool isLeftOut = false;   // has a blank already, or is in a row of dots
        bool isInLetters = false; // one on either side
        bool isBetweenWords = false;
    };

    void measure(const Clusters& clusters, float size);
    void findRuns(float size);
    void judge(const std::vector<Gap*>& run, float size);
    bool isSpacedOut(const std::vector<Gap*>& run) const;

    std::vector<Gap> gaps; // before each cluster, nothing before the first
    std::size_t count = 0; // of those between words
};

} // namespace DrawmereConvert
