#include "tools/convert/ChildCall.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstring>
#include <system_error>

#include <fcntl.h>
#include <poll.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace DrawmereConvert {
namespace {

using Clock = std::chrono::steady_clock;

[[noreturn]] void runChild(int channel, const std::function<std::string()>& call) {
    static_cast<void>(prctl(PR_SET_PDEATHSIG, SIGKILL));
    try {
        const std::string bytes = call();
        std::size_t sent = 0;
        while (sent < bytes.size()) {
            const ssize_t count = write(channel, bytes.data() + sent, bytes.size() - sent);
            if (count < 0 && errno != EINTR) {
                _exit(1);
            }
            sent += count > 0 ? static_cast<std::size_t>(count) : 0;
        }
    } catch (const std::exception&) {
        _exit(1);
    }
    _exit(0); // all else belongs to the process that it was forked off
}

/// Returns: milliseconds for `poll`, at least 0, or -1 for no limit.
int countMilliseconds(Clock::time_point deadline) {
    if (deadline == Clock::time_point::max()) {
        return -1;
    }
    const auto rest = std::chrono::ceil<std::chrono::milliseconds>(deadline - Clock::now());
    return static_cast<int>(std::clamp<std::int64_t>(rest.count(), 0, 1'000'000'000));
}

/// Returns: false when the time was over before the other end was closed.
bool readAll(int channel, Clock::time_point deadline, std::string& bytes) {
    char buffer[4096];
    for (;;) {
        pollfd waited = {channel, POLLIN, 0};
        const int ready = poll(&waited, 1, countMilliseconds(deadline));
        if (ready == 0) {
            return false;
        }
        const ssize_t count = ready < 0 ? -1 : read(channel, buffer, sizeof buffer);
        if (count == 0 || (count < 0 && errno != EINTR)) {
            return true;
        }
        bytes.append(buffer, count > 0 ? static_cast<std::size_t>(count) : 0);
    }
}

int waitFor(pid_t child) {
    int state = 0;
    while (waitpid(child, &state, 0) < 0 && errno == EINTR) {
    }
    return state;
}

pid_t forkWith(const std::function<std::string()>& call, int& channel) {
    int ends[2];
    if (pipe2(ends, O_CLOEXEC) != 0) {
        throw std::system_error(errno, std::generic_category());
    }
    const pid_t child = fork();
    if (child == 0) {
        close(ends[0]);
        runChild(ends[1], call);
    }
    const int failure = errno;
    close(ends[1]);
    channel = ends[0];
    if (child < 0) {
        close(channel);
        throw std::system_error(failure, std::generic_category());
    }
    return child;
}

} // namespace

ChildResult callApart(const std::function<std::string()>& call, double seconds) {
    int channel = -1;
    const pid_t child = forkWith(call, channel);
    const auto span =
        std::chrono::duration_cast<Clock::duration>(std::chrono::duration<double>(seconds));
    ChildResult result;
    const bool isEnded = readAll(
        channel, seconds > 0 ? Clock::now() + span : Clock::time_point::max(), result.bytes);
    close(channel);
    if (!isEnded) {
        kill(child, SIGKILL);
    }
    const int state = waitFor(child);
    result.isDone = isEnded && WIFEXITED(state) && WEXITSTATUS(state) == 0;
    if (!isEnded) {
        result.reason = "it takes too long";
    } else if (WIFSIGNALED(state)) {
        result.reason = describeBreak(state);
    }
    return result;
}

std::string describeBreak(int state) {
    return std::string("the reader of the document broke off (") + strsignal(WTERMSIG(state)) +
           ")"; // NOLINT(concurrency-mt-unsafe): one thread
}

} // namespace DrawmereConvert
