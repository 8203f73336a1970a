#include "tools/convert/InterruptGuard.h"

namespace DrawmereConvert {
namespace {

volatile std::sig_atomic_t noted = 0;

void note(int number) { noted = number; }

} // namespace

InterruptGuard::InterruptGuard() {
    noted = 0;
    sigset_t held;
    sigemptyset(&held);
    for (int i = 0; i < signalCount; ++i) {
        sigaction(signals[i], nullptr, &actionsBefore[i]);
        // What the caller of the program has switched off stays so.
        if (actionsBefore[i].sa_handler != SIG_IGN) {
            struct sigaction action = {};
            action.sa_handler = note;
            sigaction(signals[i], &action, nullptr);
            sigaddset(&held, signals[i]);
        }
    }
    sigprocmask(SIG_BLOCK, &held, &maskBefore);
}

InterruptGuard::~InterruptGuard() {
    disarm(); // what is still held back takes effect here
    if (noted != 0) {
        static_cast<void>(raise(noted));
    }
}

void InterruptGuard::disarm() const {
    for (int i = 0; i < signalCount; ++i) {
        sigaction(signals[i], &actionsBefore[i], nullptr);
    }
    sigprocmask(SIG_SETMASK, &maskBefore, nullptr);
}

bool InterruptGuard::isInterrupted() const { return noted != 0; }

} // namespace DrawmereConvert
