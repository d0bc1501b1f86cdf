#pragma once
// The lowest layer of the instrument's connection: one serial port or one socket, text in and out.

#include <cstddef>
#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/ZELBas.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/SerialPort.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "platform/Socket.h"

namespace zel {

/// `ConnectionState` chooses the link: the socket for TCPCON, the serial port for any other kind.
class ByteLink {
  public:
    ByteLink(Forms& forms, ZELBas& state, SerialPort& ZELCommC, Socket& TCPSocket,
             const Session& session, DebugChannel& debug);

    /// Opens the port at 8 data bits, no parity, 1 stop bit, no flow control; `port` is a device
    /// name. False when it cannot be had; nothing is reported.
    bool OpenSerialPort(const std::string& port, long baud);
    /// Takes port and baud rate from the dialog's lists and reports what is wrong with them.
    void OpenPortFromDialog();
    /// Sends the text, a byte a character; dropped silently when the port was not opened, and when
    /// `wireProblem` names a character of it. An answer that came late, after a time-out, is
    /// thrown away before.
    void WriteToLink(const std::string& text);
    /// What has arrived, possibly nothing. Serial never waits; TCP waits up to 0.1 s with `wait`
    /// and reads nothing without.
    std::string ReadFromLink(bool wait);
    /// Throws away what waits: up to `times` reads without waiting.
    void drain(int times);
    void CloseComPort();
    void CloseTCPSocket();

    bool isTcp() const;
    bool portOpen() const { return port_.isOpen(); }
    /// Bytes can come or have come: the serial port is open, or the socket is connected or holds
    /// what came before its end.
    bool usable() const;
    /// Reports once a connection that a socket has ended, and why.
    void tellLoss();
    /// Why the port was lost or could not be opened, for a user; empty when nothing is known.
    std::string problem() const { return port_.problem(); }
    /// Binary reads: takes what has arrived on either link, without waiting.
    std::string takeBytes();
    /// Says on the debug channel that a block of so many bytes came.
    void noteBlock(std::size_t bytes);

  private:
    std::string takeFromSocket();

    ControllerForm& panel_;
    MainForm& dialog_;
    ZELBas& state_;
    SerialPort& port_;
    Socket& socket_;
    Events& events_;
    MessageBoxes& boxes_;
    DebugChannel& debug_;
    Stopwatch StopwatchB_;
    Handlers handlers_;
};

/// The device that a port name of the dialog means: "COM" and a number in either case becomes
/// "COMn"; a name that the platform listed or that is a path stands as it is, and the last part of
/// a listed path means that path. Empty when the name is no port.
std::string serialDeviceName(const std::string& text, const std::vector<std::string>& known);

}  // namespace zel
