#include "console/ServeVerb.h"

#include <algorithm>
#include <string>
#include <vector>

#include "console/Options.h"
#include "console/Verbs.h"
#include "forms/ServerForm.h"
#include "server/ServerBridge.h"
#include "server/ServerDialog.h"
#include "support/ExitStatus.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr int kLookMs = 250;

/// "ADDRESS:PORT", "[ADDRESS]:PORT" or "PORT".
void splitListen(const std::string& text, std::string& address, std::string& port) {
    const auto colon = text.rfind(':');
    port = colon == std::string::npos ? text : text.substr(colon + 1);
    address = colon == std::string::npos ? "127.0.0.1" : text.substr(0, colon);
    if (address.size() > 2 && address.front() == '[' && address.back() == ']')
        address = address.substr(1, address.size() - 2);
    if (address == "*") address.clear();
}

void fillForm(const ServeOptions& wanted, ServerForm& form) {
    std::string port;
    splitListen(wanted.listen, form.ListenAddress, port);
    form.localPortTextBox.Text = port;
    form.COMList.setText(wanted.serial);
    form.chkBaudRate.setValue(wanted.baud == 0);
    if (wanted.baud != 0) form.BaudList.setText(std::to_string(wanted.baud));
    std::string networks;
    for (const std::string& network : wanted.allow) networks += network + " ";
    form.txtAllowed.Text = networks;
    form.chkKeep.setValue(wanted.keep);
}

}  // namespace

int runServer(const Options& options, const VerbStage& stage) {
    stage.program.start();
    ServerForm& form = stage.program.forms().server;
    ServerBridge& server = stage.program.server();
    stage.program.serverDialog().fillFields();
    fillForm(options.serve, form);
    server.relay().setQuiet(options.serve.group);
    const ServeOptions& wanted = options.serve;
    if (!wanted.tlsCertificate.empty()) {
        const std::string problem =
            server.useTls({wanted.tlsCertificate, wanted.tlsKey, wanted.tlsClients});
        if (!problem.empty()) {
            stage.errors.line("zelctl: " + problem);
            return kLinkFailed;
        }
    }
    bool lost = false;
    server.Happened.connect([&](const std::string& text) { stage.output.line(text); });
    server.Lost.connect([&] { lost = true; });
    const bool up = server.connect();
    stage.errors.settle();
    if (!up) {
        if (stage.program.ended()) return kDone;
        stage.errors.line("zelctl: " + replaceAll(server.problem(), kCrLf, " "));
        return kLinkFailed;
    }
    while (!stage.program.ended() && !lost) stage.events.wait(kLookMs);
    stage.errors.settle();
    return lost ? kLinkFailed : kDone;
}

int runDevices(const Options& options, const VerbStage& stage) {
    const std::vector<std::string> names = stage.program.deviceNames();
    if (options.serve.configure.empty()) {
        stage.output.lines(names);
        return kDone;
    }
    // Names of the file ignore case, as everything in it does; "NONE" stands for no device.
    const auto named = std::find_if(names.begin(), names.end(), [&](const std::string& name) {
        return lowerCase(name) == lowerCase(trimmed(options.serve.configure));
    });
    if (named == names.end() || names == std::vector<std::string>{"NONE"}) {
        stage.errors.line("zelctl: settings.ini has no device \"" + options.serve.configure + "\"");
        return kWrongUse;
    }
    constexpr int kUsualBaud = 57600;
    const int baud = options.serve.baud == 0 ? kUsualBaud : options.serve.baud;
    const bool ok = stage.program.configureDevice(*named, options.serve.serial, baud);
    stage.errors.settle();
    return ok ? kDone : kLinkFailed;
}

}  // namespace zel
