#include "foundation/common/MoxNodeIterable.h"

namespace MoxCommonNS {

std::uint32_t MoxNodeIterable::getTypeID() const { return typeId; }

bool MoxNodeIterable::isA(std::uint32_t id) const { return id == typeId || MoxRCObject::isA(id); }

const char* MoxNodeIterable::getTypeName() const { return "MoxNodeIterable"; }

} // namespace MoxCommonNS
