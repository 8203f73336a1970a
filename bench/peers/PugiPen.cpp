// The elements of the plain writer, kept in a tree of pugixml and saved at the end.
#include "bench/peers/ElementPen.h"
#include "bench/peers/PugiTree.h"

namespace DrawmereNS {

std::unique_ptr<Pen> makePen(const std::string& directory) {
    return std::make_unique<ElementPen<PugiTree>>(directory);
}

} // namespace DrawmereNS
