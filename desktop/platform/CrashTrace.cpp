#include "desktop/platform/CrashTrace.h"

#include <execinfo.h>
#include <fcntl.h>
#include <signal.h>
#include <sys/types.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <csignal>
#include <cstring>
#include <string>
#include <vector>

namespace zel {
namespace {

struct Fault {
    int number;
    const char* head;
};
constexpr std::array<Fault, 5> kFaults{
    {{SIGSEGV, "*******Fatal\r\n          SOURCE      : SIGSEGV\r\n"},
     {SIGABRT, "*******Fatal\r\n          SOURCE      : SIGABRT\r\n"},
     {SIGBUS, "*******Fatal\r\n          SOURCE      : SIGBUS\r\n"},
     {SIGFPE, "*******Fatal\r\n          SOURCE      : SIGFPE\r\n"},
     {SIGILL, "*******Fatal\r\n          SOURCE      : SIGILL\r\n"}}};
constexpr int kMostCalls = 64;
constexpr std::size_t kMostFiles = 3;
constexpr std::size_t kLongestPath = 4096;
constexpr std::size_t kHandlerStack = 65536;

// A handler may use nothing that allocates: all it needs stands ready.
std::array<std::array<char, kLongestPath>, kMostFiles> paths;
std::array<char, kHandlerStack> handlerStack;

void writeText(int file, const char* text) {
    [[maybe_unused]] const ssize_t written = ::write(file, text, std::strlen(text));
}

void trace(int number) {
    std::array<void*, kMostCalls> calls{};
    const int count = ::backtrace(calls.data(), kMostCalls);
    for (const auto& path : paths) {
        if (path[0] == 0) continue;
        const int file = ::open(path.data(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0600);
        if (file < 0) continue;
        for (const Fault& fault : kFaults)
            if (fault.number == number) writeText(file, fault.head);
        writeText(file, "          DESCRIPTION : the program was ended by a fault\r\n");
        ::backtrace_symbols_fd(calls.data(), count, file);
        ::close(file);
    }
    // The handler is for once: the signal now does what it does.
    ::raise(number);
}

}  // namespace

void traceFaultsInto(const std::vector<std::string>& files) {
    for (std::size_t i = 0; i < kMostFiles; ++i) {
        paths[i].fill(0);
        if (i < files.size() && files[i].size() < kLongestPath)
            std::copy(files[i].begin(), files[i].end(), paths[i].begin());
    }
    // The first call loads a library, which a handler must not do.
    std::array<void*, 1> first{};
    ::backtrace(first.data(), 1);
    stack_t own{};
    own.ss_sp = handlerStack.data();
    own.ss_size = handlerStack.size();
    ::sigaltstack(&own, nullptr);
    struct sigaction action {};
    action.sa_handler = trace;
    action.sa_flags = static_cast<int>(SA_RESETHAND | SA_ONSTACK | SA_NODEFER);
    for (const Fault& fault : kFaults) ::sigaction(fault.number, &action, nullptr);
}

}  // namespace zel
