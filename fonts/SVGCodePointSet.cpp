#include "fonts/SVGCodePointSet.h"

#include <bit>
#include <utility>

namespace DrawmereNS {
namespace {

constexpr std::size_t minSlots = 64;
constexpr std::uint32_t spread = 0x9E3779B9; // 2^32 divided by the golden ratio

/// A search ends here. By chance it never gets as far; code points picked to share a hash would.
constexpr std::size_t maxSteps = 64;

constexpr std::size_t countFitting(std::size_t slotCount) { return slotCount - slotCount / 4; }

} // namespace

bool SVGCodePointSet::insert(std::uint32_t codePoint) {
    const std::uint32_t mark = codePoint + 1;
    if (slots.empty()) {
        slots.resize(minSlots);
    }
    std::uint32_t* slot = findSlot(mark);
    if (slot && *slot == mark) {
        return false;
    }
    if (count == countFitting(slots.size())) {
        grow();
        slot = findSlot(mark);
    }
    if (slot) {
        *slot = mark;
        ++count;
    }
    return true;
}

void SVGCodePointSet::clear() {
    slots.clear();
    count = 0;
}

void SVGCodePointSet::grow() {
    const std::size_t newSize = 2 * slots.size();
    for (const std::uint32_t mark : std::exchange(slots, std::vector<std::uint32_t>(newSize))) {
        std::uint32_t* slot = mark != 0 ? findSlot(mark) : nullptr;
        if (slot) {
            *slot = mark;
        }
    }
}

/// Returns: the slot that has `mark` or may take it, null where the search was given up.
std::uint32_t* SVGCodePointSet::findSlot(std::uint32_t mark) {
    const int shift = std::countl_zero(static_cast<std::uint32_t>(slots.size())) + 1;
    std::size_t slot = (mark * spread) >> shift;
    for (std::size_t step = 0; step < maxSteps; ++step) {
        if (slots[slot] == 0 || slots[slot] == mark) {
            return &slots[slot];
        }
        slot = (slot + 1) & (slots.size() - 1);
    }
    return nullptr;
}

} // namespace DrawmereNS
