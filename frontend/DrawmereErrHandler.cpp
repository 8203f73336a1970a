#include "DrawmereErrHandler.h"

#include <exception>

namespace DrawmereNS {

DrawmereErrHandler::~DrawmereErrHandler() = default;

void DrawmereErrHandler::handleError(const MoxError& error) { error.throwFatalError(); }

void DrawmereErrHandler::handleError() {
    if (std::current_exception()) {
        throw;
    }
}

DrawmereErrHandler* DrawmereErrHandler::getDefault() {
    // Never deleted: objects that die after main may still point at it.
    static auto* const instance = new DrawmereDefaultErrHandler();
    return instance;
}

} // namespace DrawmereNS
