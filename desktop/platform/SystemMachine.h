#pragma once
// The machine that the program runs on.

#include <memory>
#include <string>

#include "platform/FolderFiles.h"
#include "platform/Machine.h"

namespace zel {

class SystemMachine : public Machine {
  public:
    MachineFacts facts() override;
    std::string environment(const std::string& name) override;
    std::unique_ptr<FolderReading> readFolder(const std::string& folder) override;
};

}  // namespace zel
