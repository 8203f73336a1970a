#include "tools/convert/WorkerProcess.h"

#include "tools/convert/ForkedProcess.h"
#include "tools/convert/InterruptGuard.h"
#include "tools/convert/PageConfig.h"
#include "tools/convert/PageWriter.h"

#include <cerrno>
#include <csignal>

#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

namespace DrawmereConvert {
namespace {

/// Returns: false when the other end is gone.
bool sendAll(int channel, const void* bytes, std::size_t size) {
    const auto* from = static_cast<const char*>(bytes);
    while (size > 0) {
        const ssize_t sent = send(channel, from, size, MSG_NOSIGNAL);
        if (sent < 0 && errno != EINTR) {
            return false;
        }
        if (sent > 0) {
            from += sent;
            size -= static_cast<std::size_t>(sent);
        }
    }
    return true;
}

/// Returns: false when the other end is gone.
bool receiveAll(int channel, void* bytes, std::size_t size) {
    auto* to = static_cast<char*>(bytes);
    while (size > 0) {
        const ssize_t count = read(channel, to, size);
        if (count == 0 || (count < 0 && errno != EINTR)) {
            return false;
        }
        if (count > 0) {
            to += count;
            size -= static_cast<std::size_t>(count);
        }
    }
    return true;
}

bool sendOutcome(int channel, const PageOutcome& outcome) {
    const std::string bytes = packOutcome(outcome);
    const std::size_t size = bytes.size();
    return sendAll(channel, &size, sizeof size) && sendAll(channel, bytes.data(), size);
}

/// All that the process does.
void serve(int channel, PageWriter& writer) {
    int page = 0;
    while (receiveAll(channel, &page, sizeof page)) {
        if (!sendOutcome(channel, page < 0 ? writer.finish() : writer.write(page))) {
            return;
        }
    }
}

} // namespace

WorkerProcess::WorkerProcess(const std::function<std::unique_ptr<PageWriter>()>& makeWriter,
                             const InterruptGuard& guard)
    : process(forkOff([&makeWriter, &guard](int channel) {
          guard.disarm();
          // A reader that is gone is a failed write.
          static_cast<void>(std::signal(SIGPIPE, SIG_IGN));
          serve(channel, *makeWriter());
      })) {}

WorkerProcess::~WorkerProcess() {
    close(process.channel);
    if (process.id > 0) {
        kill(process.id, SIGKILL);
        end();
    }
}

void WorkerProcess::start(int number, double seconds) {
    page = number;
    const auto span =
        std::chrono::duration_cast<Clock::duration>(std::chrono::duration<double>(seconds));
    deadline = seconds > 0 ? Clock::now() + span : Clock::time_point::max();
    // A process that is gone is found out when its outcome is waited for.
    sendAll(process.channel, &number, sizeof number);
}

std::optional<PageOutcome> WorkerProcess::receive() {
    std::size_t size = 0;
    if (!receiveAll(process.channel, &size, sizeof size)) {
        return std::nullopt;
    }
    std::string bytes(size, '\0');
    if (!receiveAll(process.channel, bytes.data(), size)) {
        return std::nullopt;
    }
    page.reset();
    return unpackOutcome(bytes);
}

std::string WorkerProcess::describeEnd() {
    const int state = end();
    page.reset();
    return WIFSIGNALED(state) ? describeBreak(state) : "the reader of the document ended early";
}

int WorkerProcess::end() {
    const int state = waitFor(process.id);
    process.id = -1;
    return state;
}

} // namespace DrawmereConvert
