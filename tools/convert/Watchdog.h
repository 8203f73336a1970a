/// Ends what takes too long.
#pragma once

#include "tools/convert/DocumentConverter.h"

namespace DrawmereConvert {

/// Cancels the drawing of a page when its time is over, by the timer signal of the process. There
/// can be one at a time.
class Watchdog {
public:
    /// Units: `seconds`; 0 never ends anything.
    /// Borrows: `converter`, for the life of the object.
    Watchdog(DocumentConverter& converter, double seconds);
    Watchdog(const Watchdog&) = delete;
    Watchdog& operator=(const Watchdog&) = delete;
    ~Watchdog();

    /// Returns: whether the time was over.
    bool hasBarked() const;
};

/// Starts a timer that ends the whole process with `status` and the words `message` on its error
/// stream, for what can't be cancelled. A further call starts it anew; 0 seconds stop it.
/// Borrows: `message`, until it is stopped.
void endProcessAfter(double seconds, const char* message, int status);

} // namespace DrawmereConvert
