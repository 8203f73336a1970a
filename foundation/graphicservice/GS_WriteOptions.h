/// What is stated in a written image beside its pixels.
#pragma once

namespace MoxGraphicService_NS {

struct GS_WriteOptions {
    int quality = 100;        ///< of JPEG, 1 to 100
    double xResolution = 0.0; ///< in pixels an inch, 0 to state none
    double yResolution = 0.0;
};

} // namespace MoxGraphicService_NS
