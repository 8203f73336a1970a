#include "fonts/SVGGlyphIndex.h"

#include <bit>

namespace DrawmereNS {
namespace {

constexpr std::size_t minSlots = 16;
constexpr std::uint64_t spread = 0x9E3779B97F4A7C15; // 2^64 divided by the golden ratio

/// A search ends here. By chance it never gets as far; texts made to share a hash would.
constexpr std::size_t maxSteps = 64;

/// With up to three quarters of the slots taken, a search looks at few of them.
constexpr std::size_t countFitting(std::size_t slotCount) { return slotCount - slotCount / 4; }

std::size_t countSlots(std::size_t entryCount) {
    std::size_t slotCount = minSlots;
    while (countFitting(slotCount) < entryCount) {
        slotCount *= 2;
    }
    return slotCount;
}

std::uint64_t hash(std::u16string_view text) {
    std::uint64_t result = text.size();
    for (const char16_t unit : text) {
        result = (std::rotl(result, 21) ^ unit) * spread;
    }
    return result;
}

} // namespace

bool SVGGlyphIndex::knows(const SVGGlyphMap& map, std::u16string_view text) {
    if (count != map.size() || slots.empty()) {
        fill(map);
    }
    const Entry* slot = findSlot(text);
    return slot && *slot;
}

void SVGGlyphIndex::add(const SVGGlyphMap& map, const SVGGlyphMap::value_type& entry) {
    if (slots.empty() || count + 1 != map.size()) {
        return;
    }
    if (map.size() > countFitting(slots.size())) {
        fill(map);
    } else {
        place(&entry);
    }
}

void SVGGlyphIndex::fill(const SVGGlyphMap& map) {
    slots = std::vector<Entry>(countSlots(map.size()));
    count = 0;
    for (const SVGGlyphMap::value_type& entry : map) {
        place(&entry);
    }
}

void SVGGlyphIndex::place(Entry entry) {
    if (const Entry* slot = findSlot(viewOf(entry->first))) {
        slots[slot - slots.data()] = entry;
    }
    ++count;
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
