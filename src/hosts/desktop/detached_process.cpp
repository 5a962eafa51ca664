#include "hosts/desktop/detached_process.hpp"

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>

namespace quabble {
namespace {

constexpr int commandNotFound = 127;

// What runs between fork and exec may only call what is safe there.
[[noreturn]] void becomeCommand(char* const* arguments, const char* folder) {
    ::setsid();
    if (::fork() != 0)
        ::_exit(0);
    if (::chdir(folder) != 0)
        ::_exit(commandNotFound);
    sigset_t none;
    ::sigemptyset(&none);
    ::sigprocmask(SIG_SETMASK, &none, nullptr);
    ::close(STDIN_FILENO);
    ::open("/dev/null", O_RDONLY);  // becomes the standard input
    ::execvp(arguments[0], arguments);
    ::_exit(commandNotFound);
}

}  // namespace

void startDetached(const std::vector<std::string>& command, const std::string& folder) {
    std::vector<char*> arguments;
    arguments.reserve(command.size() + 1);
    for (const std::string& argument : command)
        arguments.push_back(const_cast<char*>(argument.c_str()));
    arguments.push_back(nullptr);
    // The child leaves the command to a child of its own and ends at once, so nothing is left to wait for.
    const pid_t child = ::fork();
    if (child == 0)
        becomeCommand(arguments.data(), folder.c_str());
    if (child > 0)
        ::waitpid(child, nullptr, 0);
}

}  // namespace quabble
