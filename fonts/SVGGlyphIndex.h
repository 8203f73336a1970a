/// A shortcut to the entries of a glyph map.
#pragma once

#include "fonts/SVGEmbTLString.h"

namespace DrawmereNS {

/// Finds the entries of one map by a hash of their texts, as nearly every text that is drawn is
/// known already and a search in the map compares it with a dozen others. The map alone says what
/// there is: an index that doesn't count as many entries is made anew, and one that texts of one
/// hash crowd leaves some of them to the map.
class SVGGlyphIndex {
public:
    /// Returns: true when `map` has a key of this `text`; after a no the map has to be asked.
    /// `map` is the same in each call.
    bool knows(const SVGGlyphMap& map, std::u16string_view text);

    /// Notes what was just inserted into `map`. An index that nobody has asked so far waits until
    /// somebody does, and takes no memory.
    void add(const SVGGlyphMap& map, const SVGGlyphMap::value_type& entry);

private:
    using Entry = const SVGGlyphMap::value_type*; // borrowed from the map

    void fill(const SVGGlyphMap& map);
    void place(Entry entry);
    const Entry* findSlot(std::u16string_view text) const;

    std::vector<Entry> slots; // a power of two of them, null where none is
    std::size_t count = 0;    // of the entries noted, whether they found a slot or not
};

} // namespace DrawmereNS
