#pragma once
// The result lines of a run: which file each goes to, and how it looks.

#include <cstdint>
#include <string>

#include "files/FileOps.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/ScriptForms.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Session.h"

namespace zel {

class ResultOutput {
  public:
    /// Connects the button and the box that choose the file.
    ResultOutput(Forms& forms, FileOps& files, const Session& session);

    /// Appends one line: date, time, name, value. `name` comes back in capitals. A value is
    /// written as the number that it begins with, two parts at a semicolon as two; the values of
    /// "comment" and "loopcount" stay texts. Nothing reports a file that cannot be written.
    void saveValue(std::string& name, const std::string& value);
    void saveValue(const char* name, const std::string& value);
    /// The four results of a complex measurement: dBm, dB, radians, and the deviation in the unit
    /// that it was taken in.
    void saveDisplayedMeasurement(double levelAvg, double stdDevLevel, double phaseAvg,
                                  double stdDevPhase);
    /// Puts the file in place for the next result: "*" of the template, or of the name in force,
    /// becomes the suffix, or without one the index. With `returnTemplate` the name with its "*"
    /// comes back in `fileTemplate`.
    void buildOutputFileName(std::int16_t index, bool returnTemplate, const std::string& suffix,
                             std::string& fileTemplate);
    void restoreOutputFileName();

    void cmdSave_Click();
    void chkSave_Click();
    /// Asks for the result file; false when nothing was picked.
    bool chooseFile();

  private:
    bool askForFile();
    std::string line(const std::string& name, const std::string& value) const;
    void append(const std::string& line);

    SpecialMeasForm& form_;
    ControllerForm& panel_;
    STDForm& statistics_;
    FileOps& files_;
    Session session_;
    Handlers handlers_;
};

/// "15.11.2026; 17:05:12.345; " out of one reading of the clock.
std::string resultTimeText(const Clock& clock);
/// The numbers of an answer: "-30 dBm" gives "-30 ", "1;2" gives "1 ; 2 ".
std::string resultNumbers(const std::string& value);
/// 15 characters, small: cut, or filled with underscores.
std::string resultName(const std::string& name);

}  // namespace zel
