/// Calls into MuPDF, whose errors jump past C++.
///
/// An error of MuPDF is a longjmp to the innermost try block, which runs no destructors. So every
/// call that can fail goes through `callFitz`, with a function that holds no object with a
/// destructor while it calls.
#pragma once

#include <mupdf/fitz.h>

#include <string>

namespace DrawmereConvert {

/// Runs `call`. Returns: false when MuPDF reported an error, whose text is then
/// `fz_caught_message`.
template <class Call> bool callFitz(fz_context* ctx, const Call& call) {
    bool done = false;
    fz_var(done);
    fz_try(ctx) {
        call();
        done = true;
    }
    fz_catch(ctx) { done = false; }
    return done;
}

/// Returns: the text of the last error. Shape: a number is never part of it.
inline std::string takeFitzMessage(fz_context* ctx) { return fz_caught_message(ctx); }

} // namespace DrawmereConvert
