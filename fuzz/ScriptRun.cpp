// Any bytes as a script that runs, on a line that answers everything: no crash, no endless run, and
// the panel is free at the end.

#include <cstdint>
#include <cstdlib>
#include <string>

#include "platform/virtual/VirtualPlatform.h"
#include "script/ScriptFile.h"
#include "script/Scripts.h"
#include "shell/Program.h"
#include "support/Text.h"

namespace {

constexpr int kMostStatements = 300;
constexpr std::size_t kLargest = 4096;
constexpr std::size_t kBlock = 2410;

/// Accepts every line; a query is answered with a number, a transfer with zeros.
class AnsweringPort : public zel::SerialPort {
  public:
    bool open(const zel::SerialSetup&) override { return open_ = true; }
    void close() override { open_ = false; }
    bool isOpen() const override { return open_; }
    std::string input() override { return std::exchange(waiting_, {}); }
    void output(std::string_view bytes) override {
        for (const char c : bytes) {
            if (c != '\r') {
                line_ += c;
                continue;
            }
            waiting_ += "0\r";
            const bool second = !query_.empty();
            if (second && zel::contains(line_, "TRACEBIN")) {
                const bool complex = zel::contains(line_, "CTRACEBIN");
                waiting_ += std::string(complex ? kBlock : kBlock / 2, '\0');
            } else if (second) {
                waiting_ += "1\r";
            }
            query_ = !second && zel::upperCase(line_) == "GET" ? line_ : std::string();
            line_.clear();
        }
    }
    std::string problem() const override { return {}; }

  private:
    bool open_ = false;
    std::string line_;
    std::string query_;
    std::string waiting_;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size > kLargest) return 0;
    const std::string text(reinterpret_cast<const char*>(data), size);
    zel::VirtualPlatform platform;
    AnsweringPort port;
    zel::Program program(platform.bundle(port), "");
    program.start();
    zel::SerialSetup setup;
    port.open(setup);
    zel::Forms& forms = program.forms();
    zel::ControllerForm& panel = forms.controller;
    panel.ConnectionState = zel::ControllerForm::DIRECTCON;
    panel.isConnected = true;
    forms.main.IsConnectedToPort = true;
    panel.cmdSpecial.Click();
    zel::SpecialMeasForm& form = forms.specialMeas;
    int statements = 0;
    program.scripts().executor.StatementBegins.connect([&](int) {
        form.ReleaseWait();
        if (++statements > kMostStatements) form.cmdStop.Click();
    });
    form.lstCommands.Items = zel::loadCommandsFromText(zel::bytesToUtf8(text));
    // Loops of lines that do nothing are stopped by the clock.
    platform.events.schedule(1e9, [&] { form.cmdStop.Click(); });
    form.cmdExecute.Click();
    if (form.RunsActive != 0 || program.variables().ScriptInProgress) std::abort();
    if (!panel.PlayContinuousButton.Enabled || program.link().ScanInProgress) std::abort();
    return 0;
}
