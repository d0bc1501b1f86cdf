#include "server/InstrumentSearch.h"

#include <cstddef>
#include <string>

#include "forms/ServerForm.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "platform/Clock.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"
#include "support/RootDebug.h"
#include "support/StringOp.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kComponent = "ServerForm";
constexpr const char* kClass = "InstrumentSearch";
constexpr int kFailedPort = 4;  // a level of the log
constexpr int kFirstProbeMs = 4000;
constexpr int kAnswerMs = 2000;
constexpr int kBurstMs = 100;
constexpr int kPollMs = 10;
constexpr int kDrains = 5;
constexpr int kBehindSwitch = 2;  // the entry from which the search goes on
constexpr std::size_t kLongestAnswer = 4096;

}  // namespace

InstrumentSearch::InstrumentSearch(ServerForm& form, SerialPort& SystemCommPort,
                                   const Session& services, RootDebug& log)
    : form_(form),
      port_(SystemCommPort),
      services_(services),
      log_(log),
      ports_(services.events, services.boxes) {}

void InstrumentSearch::report(const std::string& text, bool warning) {
    const CallScope call(log_, kComponent, kClass, "report");
    problem_ = text;
    if (!stopped_) log_.LogMessage(kFailedPort, "report", replaceAll(text, kCrLf, " "));
    if (!quiet_ && !stopped_)
        services_.boxes.show({warning ? BoxIcon::Warning : BoxIcon::Plain, text});
}

void InstrumentSearch::ConnectInstrument(bool& ok) {
    const CallScope call(log_, kComponent, kClass, "ConnectInstrument");
    ok = stopped_ = false;
    problem_.clear();
    form_.ServerScanStop = false;
    if (serialDeviceName(form_.COMList.Text(), form_.COMList.items()).empty())
        return report("Please enter a valid COM port!", false);
    if (!IsNumericText(form_.BaudList.Text()))
        return report("Please enter a valid baud rate!", false);
    form_.ServerConnecting = true;
    ok = form_.chkBaudRate.Value() ? search() : openPort();
    if (ok)
        for (int i = 0; i < kDrains; ++i) port_.input();
    form_.ServerConnecting = false;
}

bool InstrumentSearch::openPort() {
    const CallScope call(log_, kComponent, kClass, "openPort");
    if (ports_.OpenComPort(port_, form_.COMList.Text(), form_.BaudList.Text())) return true;
    std::string text = "Could not connect to the specified COM port!";
    if (!port_.problem().empty()) text += kCrLf + port_.problem();
    report(text, true);
    return false;
}

bool InstrumentSearch::search() {
    const CallScope call(log_, kComponent, kClass, "search");
    form_.BaudList.setListIndex(0);
    bool switched = false;
    for (;;) {
        if (!openPort()) return false;
        const Probe result = probe();
        if (stopped_) return false;
        const bool atLineSpeed = form_.BaudList.ListIndex() == kLineSpeed;
        if (result == Probe::Found && (atLineSpeed || switched)) return true;
        if (result == Probe::Absent) break;
        const bool switches = result == Probe::Found && switchSpeed();
        ports_.CloseComPortControl(port_);
        if (stopped_) return false;
        if (switches) {
            switched = true;
            form_.ServerScanStop = false;
            form_.BaudList.setListIndex(kBehindSwitch);
        } else if (!nextEntry()) {
            break;
        }
    }
    report("No instrument found at the specified COM port!", true);
    return false;
}

InstrumentSearch::Probe InstrumentSearch::probe() {
    const CallScope call(log_, kComponent, kClass, "probe");
    bool good = false;
    CheckProbeAnswer(ask("\r\n", kFirstProbeMs), good);
    if (good) CheckProbeAnswer(ask("GET\r", kAnswerMs), good);
    std::string identity;
    if (good) {
        identity = ask("IDN?\r", kAnswerMs);
        CheckProbeAnswer(identity, good);
    }
    if (good && identity.find("Marlow") != std::string::npos) return Probe::Found;
    return form_.ServerScanStop ? Probe::Absent : Probe::Elsewhere;
}

/// False when the instrument does not want to be set.
bool InstrumentSearch::switchSpeed() {
    const CallScope call(log_, kComponent, kClass, "switchSpeed");
    bool good = false;
    CheckProbeAnswer(ask("SET\r", kAnswerMs), good);
    if (!good) return false;
    CheckProbeAnswer(ask("BAUD,2\r", kAnswerMs), good);
    return true;
}

bool InstrumentSearch::nextEntry() {
    const CallScope call(log_, kComponent, kClass, "nextEntry");
    const int next = form_.BaudList.ListIndex() + 1;
    if (next >= form_.BaudList.ListCount()) return false;
    form_.BaudList.setListIndex(next);
    return true;
}

std::string InstrumentSearch::ask(const std::string& line, int patienceMs) {
    const CallScope call(log_, kComponent, kClass, "ask");
    if (stopped_) return {};
    std::string answer;
    const Stopwatch watch(services_.clock);
    ports_.WriteComPort(port_, line);
    while (answer.empty() && watch.Elapsed() < patienceMs && !stopped_ && port_.isOpen()) {
        services_.events.wait(kPollMs);
        answer = port_.input();
    }
    const Stopwatch burst(services_.clock);
    while (!answer.empty() && burst.Elapsed() < kBurstMs && !stopped_ &&
           answer.size() < kLongestAnswer) {
        services_.events.wait(kPollMs);
        answer += port_.input();
    }
    return answer;
}

void InstrumentSearch::CheckProbeAnswer(const std::string& text, bool& ok) {
    const CallScope call(log_, kComponent, kClass, "CheckProbeAnswer");
    ok = !text.empty() && IsPrintableAnswer(text);
    // A live instrument at a wrong speed answers with noise, so that silence means that none is
    // there; at the first speed a silence is forgiven.
    if (text.empty()) {
        if (form_.BaudList.ListIndex() >= 1) form_.ServerScanStop = true;
    } else if (!ok) {
        form_.ServerScanStop = false;
    }
}

}  // namespace zel
