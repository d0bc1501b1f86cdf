#include "bench/Process.h"

#include <fcntl.h>
#include <poll.h>
#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstddef>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "bench/Figures.h"

namespace zelbench {
namespace {

constexpr std::size_t kLongestLine = 256;
constexpr int kStartSeconds = 5;

std::vector<std::string> withPty(std::vector<std::string> options) {
    options.insert(options.begin(), "--pty");
    return options;
}

}  // namespace

Process::Process(const std::string& program, const std::vector<std::string>& arguments)
    : name_(program) {
    std::array<int, 2> ends{};
    if (pipe2(ends.data(), O_CLOEXEC) != 0) throw std::runtime_error("no pipe to " + program);
    std::vector<std::string> words{program};
    words.insert(words.end(), arguments.begin(), arguments.end());
    std::vector<char*> pointers;
    pointers.reserve(words.size() + 1);
    for (std::string& word : words) pointers.push_back(word.data());
    pointers.push_back(nullptr);

    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_adddup2(&actions, ends[1], STDOUT_FILENO);
    const int failed =
        posix_spawn(&process_, program.c_str(), &actions, nullptr, pointers.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    close(ends[1]);
    output_ = ends[0];
    if (failed == 0) return;
    close(output_);
    throw std::runtime_error("cannot start " + program);
}

Process::~Process() {
    close(output_);
    kill(process_, SIGTERM);
    waitpid(process_, nullptr, 0);
}

std::string Process::line(int seconds) {
    std::string line;
    const double end = now() + seconds;
    pollfd watched{output_, POLLIN, 0};
    while (line.size() < kLongestLine) {
        const double left = end - now();
        char character = 0;
        if (left <= 0 || poll(&watched, 1, static_cast<int>(left * 1000) + 1) <= 0 ||
            read(output_, &character, 1) != 1)
            break;
        if (character == '\n') return line;
        line += character;
    }
    throw std::runtime_error("no answer of " + name_.substr(name_.find_last_of('/') + 1));
}

Simulator::Simulator(const std::string& program, std::vector<std::string> options)
    : process_(program, withPty(std::move(options))), device_(process_.line(kStartSeconds)) {}

}  // namespace zelbench
