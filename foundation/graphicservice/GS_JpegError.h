/// How libjpeg tells its errors.
#pragma once

#include <csetjmp>
#include <cstdio>

#include <jpeglib.h>

namespace MoxGraphicService_NS {

/// Errors of libjpeg end in a jump to `place`; so do those warnings that tell of damaged pixels.
struct GS_JpegError {
    jpeg_error_mgr manager; // first: libjpeg hands out its address only
    std::jmp_buf place;
};

/// Prepares `error` and returns its manager, for a new object of libjpeg.
jpeg_error_mgr* prepareJpegError(GS_JpegError& error);

} // namespace MoxGraphicService_NS
