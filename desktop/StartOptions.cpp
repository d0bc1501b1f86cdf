#include "desktop/StartOptions.h"

#include <algorithm>
#include <filesystem>
#include <optional>
#include <ostream>
#include <string>
#include <string_view>
#include <system_error>
#include <vector>

#include "desktop/platform/CommonOptions.h"
#include "desktop/platform/DeviceName.h"
#include "desktop/windows/Theme.h"
#include "support/LinkAddressText.h"
#include "support/NumberText.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kAddresses = "serial:DEVICE[@BAUD] (57600) or tcp:HOST:PORT";
constexpr int kLargestSide = 16384;

/// "1024x600".
QSize sizeOf(const std::string& text) {
    const std::vector<std::string> sides = split(text, 'x');
    if (sides.size() != 2) return {};
    const auto width = wholeNumber(sides[0], 1, kLargestSide);
    const auto height = wholeNumber(sides[1], 1, kLargestSide);
    return width && height ? QSize(*width, *height) : QSize();
}

std::string sizeProblem(const std::string& text) {
    return sizeOf(text).isValid() ? "" : "takes a size such as 1024x600, not " + text;
}

/// A word of the program has neither; a desktop hands on the whole path.
bool isFile(const std::string& word) {
    std::error_code ignored;
    return word.find_first_of("./") != std::string::npos &&
           std::filesystem::is_regular_file(word, ignored);
}

}  // namespace

std::optional<int> parseStartOptions(int argc, const char* const* argv, StartOptions& options,
                                     std::ostream& out, std::ostream& errors) {
    CLI::App app{"Remote control of the ZEL3 family of spectrum analysers.", "zelremote"};
    CommonOptions common;
    std::string theme;
    std::string size;
    std::vector<std::string> words;
    addCommonOptions(app, common, kAddresses);
    app.add_option("--theme", theme, "light, dark or system; without it the last choice")
        ->type_name("NAME")
        ->check(CLI::IsMember({"light", "dark", "system"}));
    app.add_option("--language", options.language, "en or de; without it the last choice")
        ->type_name("NAME")
        ->check(CLI::IsMember({"en", "de"}));
    app.add_option("--size", size, "Size of the window, as 1024x600")
        ->type_name("SIZE")
        ->check(sizeProblem, "");
    app.add_option("--screenshot", options.screenshot,
                   "Read one sweep, save a picture of the window, end")
        ->type_name("FILE");
    app.add_option("WORDS", words,
                   "Words of the program's command line; a saved view or recording to show");
    if (const auto status = readCommandLine(app, argc, argv, out, errors)) return status;

    options.home = common.home;
    options.words = common.words;
    options.log = common.log;
    options.given = joinArguments({argv + std::min(argc, 1), argv + argc});
    for (const std::string& word : words) {
        if (isFile(word))
            options.file = word;
        else
            options.words += (options.words.empty() ? "" : " ") + word;
    }
    if (!size.empty()) options.size = sizeOf(size);
    if (!theme.empty()) options.theme = themeFromText(QString::fromStdString(theme));
    if (common.connect.empty()) return std::nullopt;
    options.address = parseLinkAddress(common.connect);
    if (!options.address) return refuseAddress(app, kAddresses, common.connect, errors);
    useDevicePath(*options.address);
    return std::nullopt;
}

bool asksForHelp(int argc, const char* const* argv) {
    constexpr std::string_view kWords[] = {"-h", "--help", "-v", "--version"};
    return std::any_of(argv + 1, argv + argc, [&](std::string_view word) {
        return std::find(std::begin(kWords), std::end(kWords), word) != std::end(kWords);
    });
}

}  // namespace zel
