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

/// Has the timer of the process call `handler` once, in place of what it was to do before.
/// Units: `seconds`; 0 stops it.
void startTimer(double seconds, void (*handler)(int));

} // namespace DrawmereConvert
