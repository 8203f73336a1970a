#include "fonts/SVGCodePointSet.h"

namespace DrawmereNS {

void SVGCodePointSet::insert(std::uint32_t codePoint) {
    const std::size_t place = codePoint >> pageBits;
    if (place >= pageNumbers.size()) {
        pageNumbers.resize(place + 1);
    }
    if (pages.empty()) {
        pages.push_back(0);
    }
    if (pageNumbers[place] == 0) {
        pageNumbers[place] = static_cast<std::uint16_t>(pages.size());
        pages.push_back(0);
    }
    pages[pageNumbers[place]] |= std::uint64_t{1} << (codePoint & pageMask);
}

void SVGCodePointSet::clear() {
    pageNumbers.clear();
    pages.clear();
}

} // namespace DrawmereNS
