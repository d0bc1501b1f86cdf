#pragma once
// The window of the connection doctor.

#include "connection/Doctor.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "forms/SupportForms.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/Services.h"

namespace zel {

class DoctorKeys {
  public:
    DoctorKeys(Forms& forms, Doctor& doctor, Clipboard& clipboard, Events& events);
    ~DoctorKeys();
    DoctorKeys(const DoctorKeys&) = delete;
    DoctorKeys& operator=(const DoctorKeys&) = delete;

  private:
    void UtilityDoctor_Click();
    void cmdRunAgain_Click();

    DoctorForm& form_;
    MainForm& dialog_;
    Doctor& doctor_;
    Clipboard& clipboard_;
    Events& events_;
    TaskId task_ = 0;
    Handlers handlers_;
};

}  // namespace zel
