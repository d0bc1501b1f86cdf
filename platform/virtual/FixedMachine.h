#pragma once
// A machine and serial ports of the tests' own making.

#include <algorithm>
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "platform/Files.h"
#include "platform/FolderFiles.h"
#include "platform/Machine.h"
#include "platform/PortProbe.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {

class FixedMachine : public Machine {
  public:
    FixedMachine(FileService& files, VirtualClock& clock) : files_(files), clock_(clock) {}

    MachineFacts known = virtualSystem();
    std::map<std::string, std::string> variables;
    MachineFacts facts() override { return known; }
    std::string environment(const std::string& name) override {
        const auto found = variables.find(name);
        return found == variables.end() ? std::string() : found->second;
    }

    /// Milliseconds that a folder takes; those that have no entry take no time.
    std::map<std::string, int> slow;
    std::unique_ptr<FolderReading> readFolder(const std::string& folder) override {
        return std::make_unique<Reading>(filesOf(files_, folder), clock_, slow[folder]);
    }

  private:
    class Reading : public FolderReading {
      public:
        Reading(FolderFiles found, VirtualClock& clock, int ms)
            : found_(std::move(found)), clock_(clock), end_(clock.micros() + ms * 1000LL) {}
        const FolderFiles* result(int ms) override {
            const std::int64_t left = end_ - clock_.micros();
            if (left > 0) clock_.advanceMicros(std::min<std::int64_t>(left, ms * 1000LL));
            return clock_.micros() >= end_ ? &found_ : nullptr;
        }

      private:
        FolderFiles found_;
        VirtualClock& clock_;
        std::int64_t end_;
    };

    static MachineFacts virtualSystem() {
        MachineFacts facts;
        facts.operatingSystem = "Virtual System 1";
        facts.runtimeName = "Virtual library";
        facts.runtimeVersion = "1.0";
        return facts;
    }

    FileService& files_;
    VirtualClock& clock_;
};

class FixedProbe : public PortProbe {
  public:
    std::vector<SerialDevice> known;
    std::map<std::string, PortAccess> rights;
    std::map<std::string, PortHolders> held;
    std::map<std::string, ModemLines> lines;
    std::vector<std::string> managers;

    std::vector<SerialDevice> devices() override { return known; }
    PortAccess access(const std::string& path) override { return rights[path]; }
    PortHolders holders(const std::string& path) override { return held[path]; }
    std::vector<std::string> modemManagers() override { return managers; }
    std::optional<ModemLines> modemLines(const std::string& path) override {
        const auto found = lines.find(path);
        if (found == lines.end()) return std::nullopt;
        return found->second;
    }
};

}  // namespace zel
