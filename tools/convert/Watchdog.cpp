#include "tools/convert/Watchdog.h"

#include <cmath>
#include <csignal>

#include <sys/time.h>

namespace DrawmereConvert {
namespace {

// What a signal handler can reach.
DocumentConverter* watched = nullptr;
volatile std::sig_atomic_t barked = 0;

void bark(int /*signal*/) {
    barked = 1;
    if (watched) {
        watched->cancel();
    }
}

} // namespace

Watchdog::Watchdog(DocumentConverter& converter, double seconds) {
    watched = &converter;
    barked = 0;
    startTimer(seconds, &bark);
}

Watchdog::~Watchdog() {
    startTimer(0, &bark);
    watched = nullptr;
}

bool Watchdog::hasBarked() const { return barked != 0; }

void startTimer(double seconds, void (*handler)(int)) {
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = SA_RESTART;
    sigaction(SIGALRM, &action, nullptr);
    itimerval timer = {};
    const double whole = std::floor(seconds);
    timer.it_value.tv_sec = static_cast<time_t>(whole);
    timer.it_value.tv_usec = static_cast<suseconds_t>((seconds - whole) * 1e6);
    setitimer(ITIMER_REAL, &timer, nullptr);
}

} // namespace DrawmereConvert
