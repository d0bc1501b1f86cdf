// ZELSim: a simulated instrument on a pseudo terminal or a TCP port.

#include <CLI/CLI.hpp>
#include <fstream>
#include <iostream>
#include <locale>
#include <string>
#include <utility>
#include <vector>

#include "ZELSim/Device.h"
#include "ZELSim/Faults.h"
#include "ZELSim/HostLine.h"
#include "ZELSim/Modem.h"
#include "ZELSim/Phonebook.h"
#include "ZELSim/ReplayLine.h"
#include "ZELSim/Transport.h"
#include "ZELSim/TransportPty.h"
#include "ZELSim/TransportTcp.h"
#include "ZELSim/Wire.h"
#include "support/ExitStatus.h"
#include "support/NumberOption.h"
#include "support/SessionText.h"
#include "support/VersionInfo.h"

namespace {

struct Options {
    bool pty = false;
    bool modem = false;
    std::string phonebook;
    std::string link;
    std::string tcp;
    std::vector<std::string> faults;
    std::string replay;
    bool pace = false;
    zelsim::DeviceSetup device;
    zelsim::WireSetup wire;
};

int fail(const std::string& problem) {
    std::cerr << "ZELSim: " << problem << '\n';
    return zel::kLinkFailed;
}

int servePty(const Options& options, zelsim::HostLine& line) {
    zelsim::PtyEndpoint endpoint;
    if (!endpoint.open(options.link, options.wire.baud, options.wire.strictBaud, options.modem)) {
        return fail(endpoint.problem());
    }
    std::cout << endpoint.device() << '\n';
    if (!options.link.empty()) {
        std::cout << options.link << '\n';
    }
    std::cout.flush();
    return zelsim::serve(line, endpoint) ? 0 : fail("cannot wait for the line");
}

int serveTcp(const Options& options, zelsim::HostLine& wire) {
    zelsim::TcpEndpoint endpoint;
    if (!endpoint.open(options.tcp)) {
        return fail(endpoint.problem());
    }
    std::cout << endpoint.address() << std::endl;
    return zelsim::serve(wire, endpoint) ? 0 : fail("cannot wait for the line");
}

bool readPhonebook(const std::string& file, zelsim::Phonebook& book) {
    if (file.empty()) {
        book = zelsim::Phonebook::standard();
        return true;
    }
    std::ifstream text;
    text.imbue(std::locale::classic());
    text.open(file);
    std::string problem = text ? "" : "cannot be read";
    if (text && book.read(text, problem)) {
        return true;
    }
    std::cerr << "ZELSim: " << file << ": " << problem << '\n';
    return false;
}

/// The text of a session log, as far as logs are read.
bool readSession(const std::string& file, zel::SessionRecord& record) {
    std::ifstream stream;
    stream.imbue(std::locale::classic());
    stream.open(file, std::ios::binary);
    std::string text;
    char byte = 0;
    while (text.size() <= zel::kLongestSession && stream.get(byte)) {
        text += byte;
    }
    if (text.empty() || text.size() > zel::kLongestSession) {
        std::cerr << "ZELSim: " << file << ": "
                  << (text.empty() ? "cannot be read, or is empty" : "is too long") << '\n';
        return false;
    }
    record = zel::parseSession(text);
    if (!record.problem.empty()) {
        std::cerr << "ZELSim: " << file << ": " << record.problem << '\n';
    }
    return !record.events.empty();
}

int runReplay(const Options& options) {
    zel::SessionRecord record;
    if (!readSession(options.replay, record)) {
        return zel::kLinkFailed;
    }
    zelsim::catchEndSignals();
    zelsim::ReplayLine line(record, options.pace);
    line.differs = [](const std::string& what) { std::cerr << what << std::endl; };
    const int status = options.pty ? servePty(options, line) : serveTcp(options, line);
    return line.compare().difference() ? zel::kLinkFailed : status;
}

int run(Options& options) {
    if (!options.replay.empty()) {
        return runReplay(options);
    }
    zelsim::Phonebook book;
    if (!readPhonebook(options.phonebook, book)) {
        return zel::kWrongUse;
    }
    for (const std::string& text : options.faults) {
        std::string problem;
        const auto rule = zelsim::parseFault(text, problem);
        if (!rule) {
            std::cerr << "ZELSim: --fault " << text << ": " << problem << '\n';
            return zel::kWrongUse;
        }
        options.wire.faults.push_back(*rule);
    }
    options.wire.wholeAnswers = !options.pty;
    zelsim::catchEndSignals();
    zelsim::Device device(options.device);
    zelsim::Wire wire(device, options.wire);
    if (!options.pty) {
        return serveTcp(options, wire);
    }
    if (!options.modem) {
        return servePty(options, wire);
    }
    zelsim::Modem modem(wire, std::move(book));
    return servePty(options, modem);
}

}  // namespace

int main(int argc, char** argv) {
    Options options;
    CLI::App app{
        "ZELSim, a simulated ZEL3 spectrum analyser: it speaks the instrument's line protocol on\n"
        "a pseudo terminal or a TCP port until it is ended. It prints the name of the terminal\n"
        "(and of the link), or the address and port."};
    app.footer(std::string(zelsim::faultHelp()) + "\n" + std::string(zelsim::phonebookHelp()));
    app.set_version_flag("-v,--version", "ZELSim " + zel::versionText(zel::kVersion));
    auto* pty = app.add_flag("--pty", options.pty, "Serve a pseudo terminal");
    app.add_option("--link", options.link, "Make a symbolic link of this name to the terminal")
        ->type_name("NAME")
        ->needs(pty);
    auto* tcp = app.add_option("--tcp", options.tcp,
                               "Serve a TCP port (address 127.0.0.1; port 0: any free one)")
                    ->type_name("[ADDRESS:]PORT");
    pty->excludes(tcp);
    app.add_option("--baud", options.wire.baud,
                   "Pace the line: 10 bits a byte at N baud, both ways (0: as fast as it goes)")
        ->type_name("N")
        ->check(CLI::Range(0, 4000000));
    auto* strict = app.add_flag("--strict-baud", options.wire.strictBaud,
                                "With --pty: a host port at another rate than the instrument's\n"
                                "(--baud, else 57600; BAUD changes it) gets noise")
                       ->needs(pty);
    auto* modem = app.add_flag("--modem", options.modem,
                               "With --pty: a modem stands before the instrument, see below")
                      ->needs(pty)
                      ->excludes(strict);
    app.add_option("--phonebook", options.phonebook, "What becomes of calls, by number")
        ->type_name("FILE")
        ->needs(modem);
    app.add_option("--seed", options.device.seed, "Seed of the noise and of the moving signals (1)")
        ->type_name("N");
    zel::numberOption(app, "--speed", options.device.speed, 1e-3, 1e9,
                      "Sweeps take their time divided by F (1)")
        ->type_name("F");
    zel::numberOption(
        app, "--trigger-period", options.device.triggerPeriod, 0, 1e6,
        "Seconds between edges at the external trigger input (0.5); 0: none ever comes")
        ->type_name("S");
    app.add_option("--fault", options.faults, "A fault on purpose, see below")
        ->type_name("KIND[:NAME=VALUE,...]")
        ->allow_extra_args(false);
    auto* replay =
        app.add_option("--replay", options.replay,
                       "Answer as the instrument of this session log did; the first byte that\n"
                       "differs is reported on standard error, and nothing is answered from then\n"
                       "on. The status at the end is 1 then.")
            ->type_name("FILE")
            ->excludes(modem)
            ->excludes(strict);
    app.add_flag("--pace", options.pace, "With --replay: answer at the recorded times")
        ->needs(replay);
    try {
        app.parse(argc, argv);
        if (!options.pty && options.tcp.empty()) {
            throw CLI::RequiredError("--pty or --tcp");
        }
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? 0 : zel::kWrongUse;
    }
    return run(options);
}
