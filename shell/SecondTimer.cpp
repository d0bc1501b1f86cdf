#include "shell/SecondTimer.h"

#include "link/TCPIPOps.h"

namespace zel {

SecondTimer::SecondTimer(Forms& forms, Socket& serverSocket, SessionClock& sessionClock)
    : forms_(forms), socket_(serverSocket), sessionClock_(sessionClock) {
    forms_.controller.UpNow.Tick.connect([this] { UpNow_Timer(); });
}

void SecondTimer::UpNow_Timer() {
    if (socket_.state() == SocketState::Error) {
        socket_.close();
        ListenOnPort(socket_, forms_.server.localPortTextBox.Text);
        forms_.server.txtDebug.Text = "Connection broken";
    }
    sessionClock_.show();
}

}  // namespace zel
