#pragma once
// The manual command line: the line protocol, one line at a time.

#include <string>

#include "forms/ControllerForm.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "link/InstrumentLink.h"
#include "link/ZELBas.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "trace/Interlock.h"

namespace zel {

/// True for a line whose answer is only a status. The line becomes upper case.
bool IsStatusCommand(std::string& line);

class ManualCommand {
  public:
    /// Connects the box and the button.
    ManualCommand(ControllerForm& panel, const InstrumentLink& link, const Interlock& interlock);

    void SendButton_Click();
    void ManualCommandText_KeyPress(int key);
    void ManualCommandText_KeyDown(int key);

  private:
    std::string readAnswer(const std::string& upperLine, bool statusOnly);
    void showAnswer(std::string text, bool statusOnly);

    ControllerForm& panel_;
    ZELBas& state_;
    ByteLink& link_;
    AnswerReader& reader_;
    const Interlock& interlock_;
    Events& events_;
    MessageBoxes& boxes_;
    bool SetLinePending_ = false;
    Handlers handlers_;
};

}  // namespace zel
