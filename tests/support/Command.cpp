#include "tests/support/Command.h"

#include <cstdio>
#include <stdexcept>

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace DrawmereTest {
namespace {

constexpr int notRunnable = 127;

[[noreturn]] void becomeProgram(const std::vector<std::string>& words, int output) {
    std::vector<std::string> copies = words; // execvp wants bytes that it might change
    std::vector<char*> arguments;
    for (std::string& word : copies) {
        arguments.push_back(word.data());
    }
    arguments.push_back(nullptr);
    dup2(output, STDOUT_FILENO);
    dup2(output, STDERR_FILENO);
    execvp(arguments.front(), arguments.data());
    _exit(notRunnable);
}

std::string readAll(int input) {
    std::string bytes;
    char piece[4096];
    ssize_t count = 0;
    while ((count = read(input, piece, sizeof piece)) > 0) {
        bytes.append(piece, static_cast<std::size_t>(count));
    }
    return bytes;
}

} // namespace

CommandResult runCommand(const std::vector<std::string>& words) {
    int ends[2];
    if (pipe2(ends, O_CLOEXEC) != 0) {
        throw std::runtime_error("no pipe");
    }
    const pid_t child = fork();
    if (child == 0) {
        becomeProgram(words, ends[1]);
    }
    close(ends[1]);
    CommandResult result;
    result.output = readAll(ends[0]);
    close(ends[0]);
    int state = 0;
    if (child > 0 && waitpid(child, &state, 0) == child && WIFEXITED(state)) {
        result.status = WEXITSTATUS(state);
    }
    return result;
}

} // namespace DrawmereTest
