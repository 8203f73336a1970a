#include "foundation/common/MoxXmlUtil.h"

#include "foundation/common/MoxNameTable.h"

namespace MoxCommonNS {

MoxName MoxXmlUtil::makeQName(MoxName prefix, MoxName local) {
    if (!prefix) {
        return local;
    }
    UnicodeString text = MoxNameTable::getSharedNameString(prefix);
    text.append(u':').append(MoxNameTable::getSharedNameString(local));
    return MoxName(text);
}

} // namespace MoxCommonNS
