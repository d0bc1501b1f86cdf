#include "connection/Dialling.h"

#include <cstddef>
#include <string>

#include "connection/ConnectionDialog.h"
#include "connection/Disconnection.h"
#include "connection/SessionStart.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "platform/Clock.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/Text.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr double kOkSeconds = 7;
constexpr int kBetweenCommandsMs = 100;
constexpr int kPhoneAnswerMs = 500;
constexpr int kEchoMs = 1000;
constexpr int kAnswerPauseMs = 1000;
constexpr int kFarEndMs = 120'000;
constexpr std::size_t kShortestAnswer = 5;
constexpr int kRestReads = 3000;
constexpr int kReadsAPump = 100;
constexpr int kRestMs = 500;
constexpr int kCarrierSettlesMs = 2000;
constexpr int kPollMs = 20;
// What a modem says is far shorter; a line that chatters must not fill the memory.
constexpr std::size_t kLongestAnswer = 4096;

constexpr const char* kNoCarrier = "The carrier did not respond!";

struct CallWord {
    const char* word;
    const char* message;
};
constexpr CallWord kCallWords[] = {
    // A connection of 12000 bits a second is too slow for the instrument's protocol.
    {"12000", "The speed of the connection was lower than 19200!"},
    {"BUSY", "The line was busy!"},
    {"NO DIALTONE", "No Dialtone!"},
    {"NO CARRIER", kNoCarrier},
};

bool endsConnectLine(const std::string& answer) {
    const auto connect = answer.find("CONNECT");
    return connect != std::string::npos && answer.find('\r', connect) != std::string::npos;
}

}  // namespace

const char* callProblem(const std::string& answer) {
    for (const CallWord& row : kCallWords)
        if (answer.find(row.word) != std::string::npos) return row.message;
    return nullptr;
}

std::string callAnswer(std::string text, const std::string& dialled) {
    if (const auto echo = text.find(dialled); echo != std::string::npos)
        text.erase(0, echo + dialled.size());
    for (const char* late : {"\r\nOK\r\n", "OK\r\n", "OK\r"}) text = replaceAll(text, late, "");
    return text;
}

Dialling::Dialling(Forms& forms, const InstrumentLink& link, ConnectionDialog& dialog,
                   SessionStart& start, Disconnection& disconnection, const Session& session)
    : panel_(forms.controller),
      form_(forms.main),
      link_(link),
      dialog_(dialog),
      start_(start),
      disconnection_(disconnection),
      session_(session) {
    handlers_.on(form_.DialButton.Clicked, [this] { DialButton_Click(); });
    handlers_.on(form_.CancelButton.Clicked, [this] { CancelButton_Click(); });
}

double Dialling::seconds() const { return static_cast<double>(session_.clock.micros()) / 1e6; }

void Dialling::DialButton_Click() { dial(true); }

void Dialling::dial(bool readTrace) {
    if (form_.Dialling) return;
    link_.state.DialCancelled = false;
    const std::string number = trimmed(form_.TelNumberBox.Text.get());
    if (link_.bytes.portOpen()) {
        if (!panel_.ErrorFlag) {
            session_.boxes.show({BoxIcon::Critical, "Port already opened!"});
            panel_.ErrorFlag = true;
        }
        return dialOver();
    }
    dialog_.ZELButton_Click();
    if (!link_.bytes.portOpen()) return dialOver();  // the reason was reported
    form_.Dialling = true;
    form_.DialButton.Visible = false;
    form_.CancelButton.Visible = true;
    form_.DisconnectButton2.Enabled = false;
    showPointer(form_, session_.events, kHourglass);
    told_ = false;
    if (call(number)) session(collected_, readTrace);
    if (!link_.bytes.portOpen() && !panel_.isConnected && !told_) portLost();
    form_.Dialling = false;
    dialOver();
}

/// All failed ways end here; what a session needs is as it should be by then.
void Dialling::dialOver() {
    form_.DisconnectButton2.Enabled = true;
    showPointer(form_, session_.events, kArrow);
}

bool Dialling::call(const std::string& number) {
    collected_.clear();
    if (!wakeModem()) return false;
    if (!pause(kBetweenCommandsMs)) return false;
    const std::string dialled = "ATDT" + number + "\r";
    link_.bytes.ReadFromLink(true);
    send(dialled);
    if (!pause(kEchoMs)) return false;
    collected_ = callAnswer(link_.bytes.ReadFromLink(true), dialled);
    start_.setClock("start");
    if (!awaitCall(dialled, collected_)) return false;
    collectRest(dialled, collected_);
    if (!link_.bytes.portOpen()) return false;
    form_.AirBaudRateText.Text = bytesToUtf8(replaceAll(collected_, kCrLf, " "));
    bool ok{};
    CheckAnswer(collected_, ok);
    return ok;
}

bool Dialling::wakeModem() {
    const bool modem =
        panel_.ConnectionState == CF::MODEMCON || panel_.ConnectionState == CF::MODEMGSMCON;
    if (modem) {
        for (const char* command : {"AT&F\r", "AT&F0\r", "ATX3\r"}) {
            if (!pause(kBetweenCommandsMs)) return false;
            send(command);
            awaitOk();
        }
    } else {
        send("AT\r");
        if (!pause(kPhoneAnswerMs)) return false;
        awaitOk();
    }
    DialStartTime_ = seconds();
    bool ok = collected_.find("OK") != std::string::npos;
    if (!ok) ConfirmModemMode(ok);
    if (ok) return link_.bytes.portOpen();
    failed("No modem found at this port!");
    return false;
}

void Dialling::ConfirmModemMode(bool& ok) {
    send("ATQ0\r");
    ok = pause(kPhoneAnswerMs);
    if (!ok) return;
    awaitOk();
    ok = collected_.find("OK") != std::string::npos;
}

void Dialling::send(const std::string& command) {
    if (link_.bytes.portOpen()) link_.bytes.WriteToLink(command);
}

// The time runs from the former dial: a first dial looks once and goes on.
void Dialling::awaitOk() {
    while (link_.bytes.portOpen()) {
        collected_ += link_.bytes.ReadFromLink(true);
        if (collected_.size() > kLongestAnswer) collected_.erase(0, kLongestAnswer / 2);
        if (collected_.find("OK") != std::string::npos) return;
        if (seconds() > DialStartTime_ + kOkSeconds) return;
        session_.events.wait(kPollMs);
    }
}

/// False when the port was closed meanwhile: the user cancelled, or the device has gone.
bool Dialling::pause(int ms) {
    const Stopwatch watch(session_.clock);
    while (link_.bytes.portOpen() && watch.Elapsed() < ms)
        session_.events.wait(ms - watch.Elapsed());
    return link_.bytes.portOpen();
}

bool Dialling::awaitCall(const std::string& dialled, std::string& answer) {
    const Stopwatch watch(session_.clock);
    for (;;) {
        if (!link_.bytes.portOpen()) return false;
        answer = callAnswer(answer + link_.bytes.ReadFromLink(true), dialled);
        session_.events.pump();
        session_.DebugLine(std::to_string(answer.size()));
        if (answer.size() > 1) {
            if (!pause(kAnswerPauseMs)) return false;
            session_.DebugLine("----->" + bytesToUtf8(answer));
            session_.DebugLine(std::to_string(answer.size()));
        }
        if (answer.size() >= kShortestAnswer) return true;
        if (watch.Elapsed() > kFarEndMs) {
            failed(std::string(kNoCarrier) + kCrLf + "Please try again");
            return false;
        }
        session_.events.wait(kPollMs);
    }
}

/// The rest of the modem's line, which holds the speed.
void Dialling::collectRest(const std::string& dialled, std::string& answer) {
    const Stopwatch watch(session_.clock);
    const auto read = [&] {
        answer = callAnswer(answer + link_.bytes.ReadFromLink(true), dialled);
        if (answer.size() > kLongestAnswer) answer.resize(kLongestAnswer);
    };
    for (int i = 0; i < kRestReads && link_.bytes.portOpen(); ++i) {
        read();
        if (i % kReadsAPump == 0) session_.events.pump();
    }
    while (link_.bytes.portOpen() && !endsConnectLine(answer) && watch.Elapsed() < kRestMs) {
        session_.events.wait(kPollMs);
        if (link_.bytes.portOpen()) read();
    }
}

void Dialling::CheckAnswer(const std::string& text, bool& ok) {
    const char* problem = callProblem(text);
    ok = problem == nullptr;
    if (!ok) failed(std::string(problem) + kCrLf + "Please try again");
    showPointer(form_, session_.events, kArrow);
}

void Dialling::session(const std::string& answer, bool readTrace) {
    showPointer(form_, session_.events, kArrow);
    session_.DebugLine(bytesToUtf8(answer));
    if (!pause(kCarrierSettlesMs)) return;
    link_.bytes.ReadFromLink(true);
    form_.ModemConnected = true;
    form_.Dialling = false;
    told_ = true;  // the handshake reports for itself
    start_.connect();
    if (!panel_.isConnected) {
        // A call that nobody uses any more costs money.
        if (link_.bytes.portOpen() && !link_.state.DialCancelled) disconnection_.HangUpModem();
        form_.ModemConnected = false;
        closePort();
        return;
    }
    if (readTrace) start_.readFirstSweep();
}

/// The port was closed under the dial, by the user or because its device has gone.
void Dialling::portLost() {
    const std::string problem = link_.bytes.problem();
    failed(std::string("Port not open!") + (problem.empty() ? "" : kCrLf + problem));
}

void Dialling::failed(const std::string& text) {
    told_ = true;
    if (!link_.state.DialCancelled) session_.boxes.show({BoxIcon::Critical, text});
    closePort();
}

void Dialling::closePort() {
    if (link_.bytes.portOpen()) link_.bytes.CloseComPort();
    form_.IsConnectedToPort = false;
    form_.OnPic.Visible = false;
    form_.DialButton.Visible = true;
    form_.CancelButton.Visible = false;
}

void Dialling::CancelButton_Click() {
    link_.state.DialCancelled = true;
    panel_.UpNow.Enabled = false;
    panel_.TimeLabel.Caption = "00:00:00";
    closePort();
    form_.DisconnectButton2.Enabled = true;
}

}  // namespace zel
