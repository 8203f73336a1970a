#include "foundation/graphicservice/GS_Output.h"

namespace MoxGraphicService_NS {

GS_Output::GS_Output(std::ostream& target) noexcept : stream(target) {}

bool GS_Output::write(const void* bytes, std::size_t count) noexcept {
    try {
        stream.write(static_cast<const char*>(bytes), static_cast<std::streamsize>(count));
        return stream.good();
    } catch (...) {
        return false;
    }
}

bool GS_Output::flush() noexcept {
    try {
        stream.flush();
        return stream.good();
    } catch (...) {
        return false;
    }
}

} // namespace MoxGraphicService_NS
