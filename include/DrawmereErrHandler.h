/// Decides what becomes of the failures that end a document or a run.
#pragma once

#include "DrawmereExport.h"
#include "foundation/common/MoxError.h"

namespace DrawmereNS {

using MoxCommonNS::MoxError;

/// Handles what `Drawmere::finishRootSvg` and `Drawmere::finish` catch. A caller that wants these
/// two to return instead of throwing derives from it and hands its own object to
/// `Drawmere::setErrorHandler`, which borrows it.
class DRAWMERE_API DrawmereErrHandler {
public:
    virtual ~DrawmereErrHandler();

    /// Handles a failure of the library itself.
    /// Throws: a copy of `error`, unless a derived class does otherwise.
    virtual void handleError(const MoxError& error);

    /// Handles every other exception; called from the catch block that holds it.
    /// Throws: the exception in flight, unless a derived class does otherwise. Ignores: a call with
    /// no exception in flight.
    virtual void handleError();

    /// Returns: the one handler that is used as long as no other is set, a
    /// `DrawmereDefaultErrHandler`. It may be used before main and until the process ends, and by
    /// any number of threads.
    static DrawmereErrHandler* getDefault();
};

/// The handler that a new `Drawmere` uses: all failures reach the caller.
class DRAWMERE_API DrawmereDefaultErrHandler : public DrawmereErrHandler {};

} // namespace DrawmereNS
