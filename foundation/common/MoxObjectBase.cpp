#include "foundation/common/MoxObjectBase.h"

namespace MoxCommonNS {

MoxObjectBase::~MoxObjectBase() = default;

std::uint32_t MoxObjectBase::getTypeID() const { return typeId; }

bool MoxObjectBase::isA(std::uint32_t id) const { return id == typeId; }

const char* MoxObjectBase::getTypeName() const { return "MoxObjectBase"; }

} // namespace MoxCommonNS
