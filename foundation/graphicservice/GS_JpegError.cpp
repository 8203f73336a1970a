#include "foundation/graphicservice/GS_JpegError.h"

#include <algorithm>
#include <iterator>

#include <jerror.h>

namespace MoxGraphicService_NS {
namespace {

/// The warnings behind which pixels are missing or made up.
constexpr int damageCodes[] = {
    JWRN_HIT_MARKER,  JWRN_HUFF_BAD_CODE,  JWRN_JPEG_EOF,
    JWRN_MUST_RESYNC, JWRN_NOT_SEQUENTIAL, JWRN_ARITH_BAD_CODE,
};

[[noreturn]] void jumpOut(j_common_ptr object) {
    auto* error = reinterpret_cast<GS_JpegError*>(object->err);
    std::longjmp(error->place, 1);
}

void heedMessage(j_common_ptr object, int level) {
    constexpr int warningLevel = -1;
    if (level == warningLevel &&
        std::ranges::find(damageCodes, object->err->msg_code) != std::end(damageCodes)) {
        jumpOut(object);
    }
}

void ignoreMessage(j_common_ptr /*object*/) {}

} // namespace

jpeg_error_mgr* prepareJpegError(GS_JpegError& error) {
    jpeg_std_error(&error.manager);
    error.manager.error_exit = jumpOut;
    error.manager.emit_message = heedMessage;
    error.manager.output_message = ignoreMessage;
    return &error.manager;
}

} // namespace MoxGraphicService_NS
