// The yardstick: every element is written as it is drawn.
#include "bench/PlainWriter.h"
#include "bench/peers/ElementPen.h"

namespace DrawmereNS {

std::unique_ptr<Pen> makePen(const std::string& directory) {
    return std::make_unique<ElementPen<PlainWriter>>(directory);
}

} // namespace DrawmereNS
