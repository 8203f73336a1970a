/// A shortcut to the entries of a glyph map.
#pragma once

#include "fonts/SVGCodePointSet.h"
#include "fonts/SVGEmbTLString.h"

namespace DrawmereNS {

/// Finds the entries of one map by their only unit or by a hash, as nearly every text that is drawn
/// is known already and a search in the map compares it with a dozen others. The map alone says
/// what there is: an index that doesn't count as many entries is made anew, and one that texts of
/// one hash crowd leaves some of them to the map. So whoever takes entries out of the map must not
/// put as many others in before the index follows it again.
class SVGGlyphIndex {
public:
    /// Makes the index anew if `map`, the same in each call, was changed behind its back.
    void follow(const SVGGlyphMap& map) {
        if (count != map.size()) {
            fill(map);
        }
    }

    /// Returns: true when the map that was followed has a key of this `text`; after a no the map
    /// has to be asked.
    bool knows(std::u16string_view text) const {
        return text.size() == 1 ? units.contains(text.front()) : findEntry(text);
    }

    /// Notes what was just inserted into `map`. An index that never followed it waits until it
    /// does, and takes no memory.
    void add(const SVGGlyphMap& map, const SVGGlyphMap::value_type& entry);

private:
    using Entry = const SVGGlyphMap::value_type*; // borrowed from the map

    void forget();
    void fill(const SVGGlyphMap& map);
    void note(Entry entry);
    void makeRoom();
    void place(Entry entry);
    bool findEntry(std::u16string_view text) const;
    const Entry* findSlot(std::u16string_view text) const;

    SVGCodePointSet units;    // the texts of one unit
    std::vector<Entry> slots; // all others: a power of two of them, null where none is
    std::size_t taken = 0;    // of the slots
    std::size_t count = 0;    // of the entries noted, whether they found a slot or not
};

} // namespace DrawmereNS
