#include "desktop/platform/SystemCommand.h"

#include <fcntl.h>
#include <signal.h>
#include <spawn.h>
#include <stdlib.h>
#include <sys/types.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <cstring>
#include <optional>
#include <string>
#include <thread>
#include <vector>

namespace zel {
namespace {

constexpr int kBySignal = 128;

}  // namespace

std::string SystemCommand::start(const std::vector<std::string>& words) {
    if (words.empty()) return "There is no command";
    std::vector<std::string> kept = words;
    std::vector<char*> arguments;
    arguments.reserve(kept.size() + 1);
    for (std::string& word : kept) arguments.push_back(word.data());
    arguments.push_back(nullptr);

    posix_spawn_file_actions_t streams;
    posix_spawn_file_actions_init(&streams);
    posix_spawn_file_actions_addopen(&streams, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_adddup2(&streams, STDERR_FILENO, STDOUT_FILENO);
    posix_spawnattr_t how;
    posix_spawnattr_init(&how);
    sigset_t all;
    sigfillset(&all);
    sigset_t none;
    sigemptyset(&none);
    posix_spawnattr_setsigdefault(&how, &all);
    posix_spawnattr_setsigmask(&how, &none);
    posix_spawnattr_setflags(
        &how, POSIX_SPAWN_SETPGROUP | POSIX_SPAWN_SETSIGDEF | POSIX_SPAWN_SETSIGMASK);
    pid_t child = 0;
    const int problem =
        posix_spawnp(&child, arguments.front(), &streams, &how, arguments.data(), environ);
    posix_spawnattr_destroy(&how);
    posix_spawn_file_actions_destroy(&streams);
    if (problem != 0)
        return "The command " + words.front() + " cannot be started: " + std::strerror(problem);
    child_ = child;
    status_.reset();
    return {};
}

bool SystemCommand::running() {
    if (child_ == 0) return false;
    int status = 0;
    pid_t gone = 0;
    do gone = waitpid(child_, &status, WNOHANG);
    while (gone < 0 && errno == EINTR);
    if (gone == 0) return true;
    if (gone == child_)
        status_ = WIFEXITED(status) ? WEXITSTATUS(status) : kBySignal + WTERMSIG(status);
    child_ = 0;
    return false;
}

bool SystemCommand::waitForEnd(int ms) {
    using namespace std::chrono;
    constexpr milliseconds kStep{10};
    const auto end = steady_clock::now() + milliseconds(ms);
    while (running()) {
        if (steady_clock::now() >= end) return false;
        std::this_thread::sleep_for(kStep);
    }
    return true;
}

std::optional<int> SystemCommand::ended() {
    if (running()) return std::nullopt;
    const std::optional<int> status = status_;
    status_.reset();
    return status;
}

}  // namespace zel
