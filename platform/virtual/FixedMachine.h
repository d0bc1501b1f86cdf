#pragma once
// A machine and serial ports of the tests' own making.

#include <map>
#include <string>
#include <vector>

#include "platform/Machine.h"
#include "platform/PortProbe.h"

namespace zel {

class FixedMachine : public Machine {
  public:
    MachineFacts known = virtualSystem();
    std::map<std::string, std::string> variables;
    MachineFacts facts() override { return known; }
    std::string environment(const std::string& name) override {
        const auto found = variables.find(name);
        return found == variables.end() ? std::string() : found->second;
    }

  private:
    static MachineFacts virtualSystem() {
        MachineFacts facts;
        facts.operatingSystem = "Virtual System 1";
        facts.runtimeName = "Virtual library";
        facts.runtimeVersion = "1.0";
        return facts;
    }
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
