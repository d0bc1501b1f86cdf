#include "support/RoboHelp_CSH.h"

#include <filesystem>

namespace zel {
namespace {

constexpr const char* kHelpBook = "ZELRemoteHelp.chm";

}  // namespace

void RoboHelp_CSH::showTopic(int context) {
    const std::string file = (std::filesystem::path(folder_.path()) / kHelpBook).string();
    if (RH_ShowHelp(0, file, kContextHelp, context)) return;
    boxes_.show({BoxIcon::Information, "The help file " + file + " cannot be opened."});
}

bool RoboHelp_CSH::RH_ShowHelp(int /*parent*/, const std::string& helpFile, int command,
                               int context) {
    if (command != kContextHelp) return false;
    const bool own = std::filesystem::path(helpFile).filename() == kHelpBook;
    if (own && launcher_.showHelp(context)) return true;
    if (!files_.stat(helpFile).exists()) return false;
    return launcher_.start(helpFile, {std::to_string(context)});
}

}  // namespace zel
