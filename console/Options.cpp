#include "console/Options.h"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <cstddef>
#include <map>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "console/Address.h"
#include "console/AnalysisOptions.h"
#include "desktop/platform/CommonOptions.h"
#include "desktop/platform/DeviceName.h"
#include "link/WireText.h"
#include "server/Networks.h"
#include "support/ExitStatus.h"
#include "support/NumberOption.h"
#include "support/NumberText.h"
#include "support/SessionText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kMostSweeps = 1000000;
constexpr const char* kAddresses =
    "serial:DEVICE[@BAUD] (57600), tcp:HOST:PORT, tls:HOST:PORT[,FINGERPRINT], modem:, gsm:, "
    "modemgsm: or gsmmodem:DEVICE[@BAUD],NUMBER, or sim: for the built-in simulator";
constexpr double kShortestInterval = 0.001;
constexpr double kLongestInterval = 2'000'000;
constexpr int kHighestBaud = 4000000;
constexpr int kHighestPort = 65535;
constexpr const char* kImageEndings[] = {".wmf", ".svg", ".png", ".pdf"};
constexpr const char* kRowsEndings[] = {".svg", ".png", ".pdf"};

/// A keyword goes over the wire as a line of its own, so it may hold no line end.
std::string keywordProblem(const std::string& keyword) {
    const bool plain =
        std::all_of(keyword.begin(), keyword.end(), [](char c) { return c >= ' ' && c <= '~'; });
    return plain && !trimmed(keyword).empty() ? std::string() : "is no keyword: " + keyword;
}

std::string settingProblem(const std::string& setting) {
    const auto comma = setting.find(',');
    if (comma == 0 || comma == std::string::npos) return "takes KEYWORD,VALUE";
    const bool oneLine = std::none_of(setting.begin(), setting.end(),
                                      [](char c) { return (c >= 0 && c < ' ') || c == '\x7F'; });
    if (!oneLine) return "is no setting: " + setting;
    const std::string keyword = keywordProblem(setting.substr(0, comma));
    return keyword.empty() ? wireProblem(setting) : keyword;
}

template <std::size_t N>
bool endsIn(const std::string& file, const char* const (&endings)[N]) {
    const std::string name = lowerCase(file);
    return std::any_of(std::begin(endings), std::end(endings), [&name](const std::string ending) {
        return name.size() > ending.size() && name.substr(name.size() - ending.size()) == ending;
    });
}

std::string imageProblem(const std::string& file) {
    return endsIn(file, kImageEndings) ? "" : "takes a file that ends in .wmf, .svg, .png or .pdf";
}

std::string rowsProblem(const std::string& file) {
    return endsIn(file, kRowsEndings) ? "" : "takes a file that ends in .svg, .png or .pdf";
}

std::string listenProblem(const std::string& place) {
    const auto colon = place.rfind(':');
    const std::string port = colon == std::string::npos ? place : place.substr(colon + 1);
    if (wholeNumber(port, 0, kHighestPort)) return {};
    return "takes [ADDRESS:]PORT, not " + place;
}

std::string networkProblem(const std::string& text) {
    return networkOf(text) ? std::string() : "takes ADDRESS or ADDRESS/BITS, not " + text;
}

struct Parser {
    CLI::App app{"ZELRemote without a window: works a ZEL3 spectrum analyser from the console.",
                 "zelctl"};
    CommonOptions common;
    std::map<const CLI::App*, Verb> verbs;
    AnalysisOptions analysis;  ///< of the verb analyse
    std::string analysisProblem;

    explicit Parser(Options& options) {
        addCommonOptions(app, common, kAddresses);
        app.add_flag("--verbose", options.verbose,
                     "Each step of the exchanges on standard error, with the time in ms");
        app.require_subcommand(1);
        app.fallthrough();

        verb(Verb::Info, "info", "Prints identity and settings of the instrument");
        CLI::App* get = verb(Verb::Get, "get", "Asks for one value and prints the answer");
        get->add_option("KEYWORD", options.argument, "Word of the instrument, such as FREQ")
            ->required()
            ->check(keywordProblem, "");
        CLI::App* set = verb(Verb::Set, "set", "Changes one setting");
        set->add_option("SETTING", options.argument, "KEYWORD,VALUE, such as FREQ,1500000000")
            ->required()
            ->check(settingProblem, "");
        CLI::App* cmd = verb(Verb::Cmd, "cmd", "Carries out one command");
        cmd->add_option("KEYWORD", options.argument, "Word of the instrument, such as INIT")
            ->required()
            ->check(keywordProblem, "");
        CLI::App* sweep = verb(Verb::Sweep, "sweep", "Reads sweeps and prints them as x,value");
        sweep->add_option("--count", options.count, "How many sweeps")
            ->check(CLI::Range(1, kMostSweeps));
        outputOption(sweep, options, "Saves the view as the panel does");
        imageOption(sweep, options);
        rowsOptions(sweep, options);
        sweep
            ->add_option_function<std::string>(
                "--analyse",
                [this, &options](const std::string& text) {
                    options.analysis.emplace();
                    analysisProblem = parseAnalysisText(text, *options.analysis);
                },
                "Prints results in place of the rows; \"OPTIONS\" are those of analyse")
            ->type_name("\"OPTIONS\"");
        CLI::App* record = verb(Verb::Record, "record", "Records traces by a timer");
        numberOption(*record, "--interval", options.interval, kShortestInterval, kLongestInterval,
                     "Seconds from trace to trace")
            ->required();
        record->add_option("--count", options.count, "How many traces")
            ->required()
            ->check(CLI::Range(1, kMostSweeps));
        outputOption(record, options, "File of the recording")->required();
        CLI::App* show = verb(Verb::Show, "show", "Loads a saved view and prints its rows");
        show->add_option("FILE", options.argument, "Saved view, recording or log")->required();
        imageOption(show, options);
        rowsOptions(show, options);
        CLI::App* run = verb(Verb::Run, "run", "Runs a measurement script");
        run->add_option("SCRIPT", options.argument, "The script, a text file")->required();
        outputOption(run, options, "File of the results");
        run->add_flag("--rehearse", options.rehearse,
                      "Only reports how the run would go; no file is written, no port opened");
        CLI::App* panel =
            verb(Verb::Panel, "panel", "Works the panel by the names of its controls");
        panel->add_option("FILE", options.argument, "Lines of commands; standard input without it");
        addRemoteVerbs(options);
        CLI::App* analyse =
            verb(Verb::Analyse, "analyse", "Measures the traces of saved views and recordings");
        analyse->add_option("FILE", options.traceFiles, "Saved views and recordings")->required();
        addAnalysisOptions(*analyse, analysis);
        addSupportVerbs(options);
    }

    void addSupportVerbs(Options& options) {
        verb(Verb::Words, "words", "Lists the instrument's words: meaning, unit, range or codes");
        CLI::App* doctor =
            verb(Verb::Doctor, "doctor", "Finds out what is wrong on the way to the instrument");
        doctor->add_option("URL", options.argument, std::string("The connection: ") + kAddresses);
        CLI::App* replay =
            verb(Verb::Replay, "replay", "Runs a recorded session again and compares");
        replay->add_option("FILE", options.argument, "Session log, as --log writes it")->required();
    }

    void addRemoteVerbs(Options& options) {
        ServeOptions& to = options.serve;
        CLI::App* serve = verb(Verb::Serve, "serve", "Serves an instrument at a TCP port");
        serve->add_option("--serial", to.serial, "Serial port of the instrument")
            ->type_name("DEVICE")
            ->required();
        serve->add_option("--baud", to.baud, "Its baud rate; searched without it")
            ->type_name("N")
            ->check(CLI::Range(1, kHighestBaud));
        serve
            ->add_option("--listen", to.listen,
                         "Where clients connect (127.0.0.1:2277; port 0: any free one; address *: "
                         "all)")
            ->type_name("[ADDRESS:]PORT")
            ->check(listenProblem, "");
        serve
            ->add_option("--allow", to.allow,
                         "Who may connect: ADDRESS or ADDRESS/BITS, as often as you like (the "
                         "loopback and private ranges)")
            ->type_name("NET")
            ->allow_extra_args(false)
            ->check(networkProblem, "");
        serve->add_flag("--keep", to.keep, "Keep the client at work: refuse newcomers");
        serve->add_option("--group", to.group, "Quiet ms that end a group of bytes (10)")
            ->type_name("MS")
            ->check(CLI::Range(0, 100));
        CLI::Option* certificate =
            serve->add_option("--tls-certificate", to.tlsCertificate, "Serve TLS, with this chain")
                ->type_name("FILE");
        CLI::Option* key =
            serve->add_option("--tls-key", to.tlsKey, "Private key of the certificate")
                ->type_name("FILE")
                ->needs(certificate);
        certificate->needs(key);
        serve->add_option("--tls-clients", to.tlsClients, "Authority that clients must be of")
            ->type_name("FILE")
            ->needs(certificate);
        CLI::App* devices =
            verb(Verb::Devices, "devices", "Lists communication devices, or configures one");
        CLI::Option* port =
            devices->add_option("--serial", to.serial, "Port of the device")->type_name("DEVICE");
        devices->add_option("--configure", to.configure, "Sends this device its commands")
            ->type_name("NAME")
            ->needs(port);
        devices->add_option("--baud", to.baud, "Baud rate (57600)")
            ->type_name("N")
            ->check(CLI::Range(1, kHighestBaud));
    }

    static CLI::Option* outputOption(CLI::App* verb, Options& options, const char* what) {
        return verb->add_option("--output", options.output, what)->type_name("FILE");
    }

    static void imageOption(CLI::App* verb, Options& options) {
        verb->add_option("--image", options.image,
                         "Draws the graph into a file: wmf, svg, png or pdf by its ending")
            ->type_name("FILE")
            ->check(imageProblem, "");
    }

    static void rowsOptions(CLI::App* verb, Options& options) {
        verb->add_option("--waterfall", options.waterfall,
                         "Draws the rows in depth into a file: svg, png or pdf by its ending")
            ->type_name("FILE")
            ->check(rowsProblem, "");
        verb->add_option("--spectrogram", options.spectrogram,
                         "Draws the rows from above into a file: svg, png or pdf by its ending")
            ->type_name("FILE")
            ->check(rowsProblem, "");
    }

    CLI::App* verb(Verb which, const std::string& name, const std::string& what) {
        CLI::App* command = app.add_subcommand(name, what);
        verbs[command] = which;
        return command;
    }
};

std::string missing(const Options& options) {
    if (options.verb == Verb::Panel || options.verb == Verb::Show || options.verb == Verb::Serve ||
        options.verb == Verb::Devices || options.verb == Verb::Analyse ||
        options.verb == Verb::Words || options.verb == Verb::Doctor || options.verb == Verb::Replay)
        return {};
    if (options.verb == Verb::Run && !options.address) return {};
    if (!options.address) return "this verb needs an instrument: --connect URL";
    if (upperCase(options.words).find("SERVER") != std::string::npos)
        return "the word SERVER goes with the verb panel only";
    return {};
}

}  // namespace

std::optional<int> parseOptions(int argc, const char* const* argv, Options& options,
                                std::ostream& out, std::ostream& errors) {
    Parser parser(options);
    parser.app.failure_message([](const CLI::App* app, const CLI::Error& problem) {
        const std::vector<std::string> unknown = app->remaining();
        if (!app->get_subcommands().empty() || unknown.empty())
            return CLI::FailureMessage::simple(app, problem);
        return "zelctl: there is no verb \"" + unknown.front() +
               "\"\nRun with --help for more information.\n";
    });
    if (const auto status = readCommandLine(parser.app, argc, argv, out, errors)) return status;
    options.home = parser.common.home;
    options.words = parser.common.words;
    options.log = parser.common.log;
    options.given = joinArguments({argv + std::min(argc, 1), argv + argc});
    options.serve.serial = devicePath(options.serve.serial);
    options.verb = parser.verbs.at(parser.app.get_subcommands().front());
    if (const std::string& url = parser.common.connect; !url.empty()) {
        options.address = parseAddress(url);
        if (!options.address) return refuseAddress(parser.app, kAddresses, url, errors);
    }
    if (options.verb == Verb::Doctor && !options.argument.empty()) {
        options.address = parseAddress(options.argument);
        if (!options.address)
            return refuseAddress(parser.app, kAddresses, options.argument, errors);
    }
    if (options.verb == Verb::Analyse) {
        options.analysis = parser.analysis;
        parser.analysisProblem = analysisProblem(parser.analysis);
    }
    const std::string problem =
        parser.analysisProblem.empty() ? missing(options) : parser.analysisProblem;
    if (!problem.empty()) {
        errors << "zelctl: " << problem << '\n';
        return kWrongUse;
    }
    return std::nullopt;
}

}  // namespace zel
