#include "fonts/SVGGlyphIndex.h"

#include <algorithm>
#include <bit>
#include <cstring>
#include <utility>

namespace DrawmereNS {
namespace {

constexpr std::size_t minSlots = 16;
constexpr std::uint64_t spread = 0x9E3779B97F4A7C15; // 2^64 divided by the golden ratio

/// A search ends here. By chance it never gets as far; texts made to share a hash would.
constexpr std::size_t maxSteps = 256;

/// With up to three quarters of the slots taken, a search looks at few of them.
constexpr std::size_t countFitting(std::size_t slotCount) { return slotCount - slotCount / 4; }

/// Takes four units at a time.
std::uint64_t hash(std::u16string_view text) {
    std::uint64_t result = text.size();
    while (!text.empty()) {
        std::uint64_t units = 0;
        const std::size_t piece = std::min(text.size(), sizeof units / sizeof(char16_t));
        for (std::size_t i = 0; i < piece; ++i) {
            units = units << 16 | text[i];
        }
        result = (std::rotl(result, 27) ^ units) * spread;
        text.remove_prefix(piece);
    }
    return (result ^ result >> 32) * spread; // texts that differ little would stand in crowds
}

} // namespace

void SVGGlyphIndex::add(const SVGGlyphMap& map, const SVGGlyphMap::value_type& entry) {
    const bool isAsked = count != 0 || !slots.empty();
    if (!isAsked) {
        return;
    }
    if (count + 1 == map.size()) {
        note(&entry);
    } else {
        forget(); // as the count may be right again now, and entries gone
    }
}

void SVGGlyphIndex::forget() {
    units.clear();
    slots.clear();
    taken = 0;
    count = 0;
}

void SVGGlyphIndex::fill(const SVGGlyphMap& map) {
    forget();
    for (const SVGGlyphMap::value_type& entry : map) {
        note(&entry);
    }
}

void SVGGlyphIndex::note(Entry entry) {
    ++count;
    const std::u16string_view text = viewOf(entry->first);
    if (text.size() == 1) {
        units.insert(text.front());
        return;
    }
    if (taken == countFitting(slots.size())) {
        makeRoom();
    }
    place(entry);
}

void SVGGlyphIndex::makeRoom() {
    const std::size_t newSize = std::max(minSlots, 2 * slots.size());
    taken = 0;
    for (const Entry entry : std::exchange(slots, std::vector<Entry>(newSize))) {
        if (entry) {
            place(entry);
        }
    }
}

void SVGGlyphIndex::place(Entry entry) {
    if (const Entry* slot = findSlot(viewOf(entry->first))) {
        slots[slot - slots.data()] = entry;
        ++taken;
    }
}

bool SVGGlyphIndex::findEntry(std::u16string_view text) const {
    const Entry* slot = slots.empty() ? nullptr : findSlot(text);
    return slot && *slot;
}

const SVGGlyphIndex::Entry* SVGGlyphIndex::findSlot(std::u16string_view text) const {
    const int shift = std::countl_zero(slots.size()) + 1; // the high bits of a product are the best
    std::size_t slot = hash(text) >> shift;
    for (std::size_t step = 0; step < maxSteps; ++step) {
        const Entry& entry = slots[slot];
        if (!entry || viewOf(entry->first) == text) {
            return &entry;
        }
        slot = (slot + 1) & (slots.size() - 1);
    }
    return nullptr;
}

} // namespace DrawmereNS
