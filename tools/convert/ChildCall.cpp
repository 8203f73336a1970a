#include "tools/convert/ChildCall.h"

#include "tools/convert/ForkedProcess.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <system_error>

#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

namespace DrawmereConvert {
namespace {

using Clock = std::chrono::steady_clock;

void writeAll(int channel, const std::string& bytes) {
    std::size_t sent = 0;
    while (sent < bytes.size()) {
        const ssize_t count = write(channel, bytes.data() + sent, bytes.size() - sent);
        if (count < 0 && errno != EINTR) {
            throw std::system_error(errno, std::generic_category());
        }
        sent += count > 0 ? static_cast<std::size_t>(count) : 0;
    }
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

} // namespace

ChildResult callApart(const std::function<std::string()>& call, double seconds) {
    const ForkedProcess child = forkOff([&call](int channel) { writeAll(channel, call()); });
    const auto span =
        std::chrono::duration_cast<Clock::duration>(std::chrono::duration<double>(seconds));
    ChildResult result;
    const bool isEnded = readAll(
        child.channel, seconds > 0 ? Clock::now() + span : Clock::time_point::max(), result.bytes);
    close(child.channel);
    if (!isEnded) {
        kill(child.id, SIGKILL);
    }
    const int state = waitFor(child.id);
    result.isDone = isEnded && WIFEXITED(state) && WEXITSTATUS(state) == 0;
    if (!isEnded) {
        result.reason = "it takes too long";
    } else if (WIFSIGNALED(state)) {
        result.reason = describeBreak(state);
    }
    return result;
}

} // namespace DrawmereConvert
