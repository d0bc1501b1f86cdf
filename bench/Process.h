#pragma once
// A process that the bench starts, whose output it reads by lines, and that ends with the object.

#include <sys/types.h>

#include <string>
#include <vector>

namespace zelbench {

class Process {
  public:
    /// `program` is a file. Throws std::runtime_error when it does not start.
    Process(const std::string& program, const std::vector<std::string>& arguments);
    ~Process();
    Process(const Process&) = delete;
    Process& operator=(const Process&) = delete;

    /// The next line of the standard output. Throws std::runtime_error when none comes within
    /// `seconds`.
    std::string line(int seconds);
    pid_t id() const { return process_; }

  private:
    std::string name_;
    pid_t process_ = -1;
    int output_ = -1;
};

/// A ZELSim that serves a pseudo terminal.
class Simulator {
  public:
    /// `program` is the file of ZELSim; `options` follow "--pty".
    Simulator(const std::string& program, std::vector<std::string> options);
    const std::string& device() const { return device_; }

  private:
    Process process_;
    std::string device_;
};

}  // namespace zelbench
