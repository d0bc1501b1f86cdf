#pragma once
// The start of a session: wakes the instrument, identifies it and reads its whole state.

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/AnswerReader.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "link/InstrumentLink.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "platform/Event.h"
#include "platform/Session.h"
#include "trace/FrequencyLabels.h"

namespace zel {

class Handshake {
  public:
    Handshake(Forms& forms, ZEL3Variables& mirror, const InstrumentLink& link,
              FrequencyLabels& labels, const MenuRoutines& menus, const Session& session);

    /// The link is up; `isConnected` shows the outcome. Any failure leaves the panel as far as it
    /// got, and the dialog's `AdviceLabel` says what to check. The dialog's Cancel leaves it.
    void InitConnection();

  private:
    void connect();
    bool wakeInstrument();
    /// False once a silence has taken the connection down, which was reported then.
    bool instrumentAnswers() const;
    void acceptRemote();
    bool identify();
    bool readDetector();
    void readMode();
    bool readState();
    bool query(const char* word, double& field);
    void connectedLook();
    void noInstrument(bool told);

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
    Session session_;
    Handlers handlers_;
};

}  // namespace zel
