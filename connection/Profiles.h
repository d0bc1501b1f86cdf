#pragma once
// The connection dialog's fields, kept between runs: one section a kind of connection.

#include "forms/ControllerForm.h"
#include "forms/MainForm.h"
#include "platform/Services.h"

namespace zel {

/// The application under which all settings are kept.
inline constexpr const char* kProgramName = "ZELRemote";

class Profiles {
  public:
    Profiles(const ControllerForm& panel, MainForm& dialog, SettingsStore& settings)
        : panel_(panel), dialog_(dialog), settings_(settings) {}

    void LoadSettings_Click();
    void SaveSettings_Click();

  private:
    ControllerForm const& panel_;
    MainForm& dialog_;
    SettingsStore& settings_;
};

}  // namespace zel
