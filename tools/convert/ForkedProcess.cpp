#include "tools/convert/ForkedProcess.h"

#include <cerrno>
#include <csignal>
#include <cstring>
#include <system_error>

#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

namespace DrawmereConvert {
namespace {

[[noreturn]] void runChild(int channel, const std::function<void(int)>& run) {
    static_cast<void>(prctl(PR_SET_PDEATHSIG, SIGKILL));
    try {
        run(channel);
    } catch (const std::exception&) {
        _exit(1);
    }
    _exit(0); // all else belongs to the process that it was forked off
}

} // namespace

ForkedProcess forkOff(const std::function<void(int channel)>& run) {
    int ends[2];
    if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends) != 0) {
        throw std::system_error(errno, std::generic_category());
    }
    const pid_t child = fork();
    if (child == 0) {
        close(ends[0]);
        runChild(ends[1], run);
    }
    const int failure = errno;
    close(ends[1]);
    if (child < 0) {
        close(ends[0]);
        throw std::system_error(failure, std::generic_category());
    }
    return {child, ends[0]};
}

int waitFor(pid_t process) {
    int state = 0;
    while (waitpid(process, &state, 0) < 0 && errno == EINTR) {
    }
    return state;
}

std::string describeBreak(int state) {
    return std::string("the reader of the document broke off (") + strsignal(WTERMSIG(state)) +
           ")"; // NOLINT(concurrency-mt-unsafe): one thread
}

} // namespace DrawmereConvert
