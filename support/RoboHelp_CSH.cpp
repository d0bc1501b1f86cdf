#include "support/RoboHelp_CSH.h"

#include <filesystem>
#include <functional>
#include <string>
#include <string_view>

#include "platform/MessageBox.h"
#include "support/Text.h"

namespace zel {
namespace {

bool endsWith(const std::string& text, std::string_view tail) {
    return text.size() >= tail.size() && text.substr(text.size() - tail.size()) == tail;
}

bool isWeb(const std::string& source) {
    const std::string name = lowerCase(source);
    return startsWith(name, "http://") || startsWith(name, "https://");
}

bool isPage(const std::string& source) {
    const std::string name = lowerCase(source);
    return endsWith(name, ".htm") || endsWith(name, ".html");
}

struct Place {
    int command;
    const char* marker;
};
constexpr Place kPlaces[] = {
    {RoboHelp_CSH::kTableOfContents, "#<cmd=toc"},
    {RoboHelp_CSH::kIndex, "#<cmd=idx"},
    {RoboHelp_CSH::kSearch, "#<cmd=fts"},
};

}  // namespace

std::string RoboHelp_CSH::book() const {
    namespace fs = std::filesystem;
    const fs::path folders[] = {folder_.programPath(), folder_.path()};
    for (const fs::path& folder : folders)
        if (const std::string own = (folder / kOwnBook).string(); files_.stat(own).isRegular())
            return own;
    return (fs::path(folder_.path()) / kBookName).string();
}

void RoboHelp_CSH::showTopic(int context) {
    const std::string file = (std::filesystem::path(folder_.path()) / kBookName).string();
    if (RH_ShowHelp(0, file, kContextHelp, context)) return;
    boxes_.show({BoxIcon::Information, "The help file " + file + " cannot be opened."});
}

std::string RoboHelp_CSH::webAddress(const std::string& source, int command, int context) {
    for (const Place& place : kPlaces)
        if (place.command == command) return source + place.marker;
    const std::string number = std::to_string(context);
    if (isPage(source)) return source + "#<id=" + number;
    return source + (contains(source, "?") ? "&" : "?") + "ctxid=" + number +
           "&cmd=newwnd&rtype=iefrm";
}

bool RoboHelp_CSH::open(const std::string& file, int command, int context,
                        const std::function<bool(const std::string&, int, int)>& call) {
    if (!files_.stat(file).isRegular()) return false;
    if (call) return call(file, command, context);
    return launcher_.start(file, {std::to_string(context)});
}

bool RoboHelp_CSH::RH_ShowHelp(int /*parent*/, const std::string& helpFile, int command,
                               int context) {
    if (isWeb(helpFile)) return launcher_.start(webAddress(helpFile, command, context), {});
    const std::string name = lowerCase(helpFile);
    if (endsWith(name, ".hlp")) return open(helpFile, command, context, WinHelpA);
    if (!endsWith(name, ".chm")) return false;
    // The program's own book answers to the name that the forms know.
    const bool own = std::filesystem::path(helpFile).filename() == kBookName;
    if (own && command == kContextHelp && launcher_.showHelp(context)) return true;
    return open(own ? book() : helpFile, command, context, HtmlHelpA);
}

}  // namespace zel
