#include "tools/convert/LastWords.h"

#include "tools/convert/Watchdog.h"

#include <array>
#include <csignal>
#include <vector>

#include <unistd.h>

namespace DrawmereConvert {
namespace {

// What a signal handler can reach.
std::string late;
std::string crash;
int status = 0;

// A crash may be for want of stack.
constexpr std::size_t stackBytes = 65536;
std::vector<char> handlerStack;

#if defined(__SANITIZE_ADDRESS__)
constexpr std::array<int, 0> crashes{}; // its own report says more
#else
constexpr std::array crashes = {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT};
#endif

void sayAndEnd(int signal) {
    const std::string& text = signal == SIGALRM ? late : crash;
    static_cast<void>(!write(STDERR_FILENO, text.data(), text.size()));
    _exit(status);
}

void useHandlerStack() {
    handlerStack.resize(stackBytes);
    stack_t stack = {};
    stack.ss_sp = handlerStack.data();
    stack.ss_size = handlerStack.size();
    sigaltstack(&stack, nullptr);
}

void handleCrashes(void (*handler)(int)) {
    struct sigaction action = {};
    action.sa_handler = handler;
    action.sa_flags = SA_ONSTACK | SA_RESETHAND;
    for (const int signal : crashes) {
        sigaction(signal, &action, nullptr);
    }
}

} // namespace

LastWords::LastWords(const std::string& lateText, const std::string& crashText, double seconds,
                     int exitStatus) {
    late = lateText;
    crash = crashText;
    status = exitStatus;
    useHandlerStack();
    handleCrashes(&sayAndEnd);
    startTimer(seconds, &sayAndEnd);
}

LastWords::~LastWords() {
    startTimer(0, SIG_DFL);
    handleCrashes(SIG_DFL);
}

} // namespace DrawmereConvert
