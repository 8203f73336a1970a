#include "foundation/common/MoxName.h"

#include "foundation/common/MoxNameTable.h"

namespace MoxCommonNS {

MoxName::MoxName(const UnicodeString& text) : number(MoxNameTable::intern(text).number) {}

} // namespace MoxCommonNS
