#pragma once
// The start of a session: wakes the instrument, identifies it and reads its whole state.

#include <string>

#include "forms/Forms.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "panel/SoftPanel.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "trace/FrequencyLabels.h"

namespace zel {

class Handshake {
  public:
    Handshake(Forms& forms, ZEL3Variables& mirror, ZELBas& state, ByteLink& link,
              AnswerReader& reader, CommandExchange& exchange, FrequencyLabels& labels,
              SoftPanel& softPanel, MenuFill& fill, Events& events, MessageBoxes& boxes);

    /// The link is up; `isConnected` tells the outcome. Any failure leaves the panel as far as it
    /// got.
    void InitConnection();

  private:
    bool wakeInstrument();
    /// False once a silence has taken the connection down, which was told then.
    bool instrumentAnswers() const;
    void acceptRemote();
    bool identify();
    bool readDetector();
    void readMode();
    bool readState();
    bool query(const char* word, double& field);
    void connectedLook();
    void noInstrument(bool told);
    void mouse(int shape);

    Forms& forms_;
    ControllerForm& panel_;
    MainForm& dialog_;
    ZEL3Variables& mirror_;
    ZELBas& state_;
    ByteLink& link_;
    AnswerReader& reader_;
    CommandExchange& exchange_;
    FrequencyLabels& labels_;
    SoftPanel& softPanel_;
    MenuFill& fill_;
    Events& events_;
    MessageBoxes& boxes_;
};

}  // namespace zel
