#include "foundation/common/MoxRCObject.h"

namespace MoxCommonNS {

std::uint32_t MoxRCObject::getTypeID() const { return typeId; }

bool MoxRCObject::isA(std::uint32_t id) const { return id == typeId || MoxObjectBase::isA(id); }

const char* MoxRCObject::getTypeName() const { return "MoxRCObject"; }

void MoxRCObject::destroy() const { delete this; }

} // namespace MoxCommonNS
