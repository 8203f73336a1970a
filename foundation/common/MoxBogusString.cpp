#include "foundation/common/MoxBogusString.h"

namespace MoxCommonNS {
namespace {

UnicodeString* makeBogusString() {
    auto* text = new UnicodeString();
    text->setToBogus();
    return text;
}

} // namespace

const UnicodeString& MoxBogusString::getValue() {
    // Never deleted: objects that die after main may still hold a reference to it.
    static const UnicodeString* const value = makeBogusString();
    return *value;
}

} // namespace MoxCommonNS
