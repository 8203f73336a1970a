#include "post/QuilletExtention.h"

namespace DrawmereNS {

void QuilletExtention::optimizeQuillet(MoxElement* /*root*/) {}

} // namespace DrawmereNS
