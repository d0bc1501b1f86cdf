#include "bench/CoreSession.h"

#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>

#include "platform/LinkAddress.h"
#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "platform/SerialPort.h"
#include "shell/Program.h"
#include "trace/TraceReader.h"

namespace zelbench {

CountingPort::CountingPort(zel::SerialPort& port) : port_(port) {
    port_.OnComm.connect([this](int code) { OnComm(code); });
}

std::string CountingPort::input() {
    std::string bytes = port_.input();
    bytes_ += bytes.size();
    return bytes;
}

void CountingPort::output(std::string_view bytes) {
    bytes_ += bytes.size();
    port_.output(bytes);
}

zel::BoxAnswer NoBoxes::show(const zel::Box& box) { throw std::runtime_error(box.text); }

std::optional<std::string> NoBoxes::prompt(const std::string& text, const std::string& /*title*/,
                                           const std::string& /*preset*/) {
    throw std::runtime_error(text);
}

CoreSession::CoreSession(const std::string& device, int baud)
    : CoreSession({zel::LinkAddress::Kind::Serial, device, baud}) {}

CoreSession::CoreSession(const zel::LinkAddress& address) : platform_(home_.path()) {
    const zel::Platform own = platform_.bundle(boxes_, platform_.fileDialogs);
    // The counter takes the serial port's place; all else is the platform as the program has it.
    const zel::Platform counted{own.clock,       own.events,    own.boxes,       port_,
                                own.serialPorts, own.tcpSocket, own.serverPort,  own.serverSocket,
                                own.settings,    own.debug,     own.clipboard,   own.launcher,
                                own.startup,     own.folder,    own.fileDialogs, own.files,
                                own.endSignals,  own.machine,   own.portProbe};
    program_ = std::make_unique<zel::Program>(counted, "");
    program_->start();
    if (!program_->connect(address, false))
        throw std::runtime_error("the program does not connect to " + address.port);
}

CoreSession::~CoreSession() { program_->disconnect(); }

void CoreSession::sweep() {
    bool success = false;
    program_->traces().ReadSingleTrace(success);
    if (!success) throw std::runtime_error("a sweep failed");
}

}  // namespace zelbench
