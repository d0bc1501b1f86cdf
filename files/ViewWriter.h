#pragma once
// Saves what the panel shows: a view with its header, a line of the power log.

#include <string>

#include "files/FileOps.h"
#include "files/OutputFile.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "platform/Event.h"
#include "platform/Session.h"
#include "trace/Sweep.h"

namespace zel {

class ViewWriter {
  public:
    /// Connects the menu entry and the read cycle's request to save.
    ViewWriter(Forms& forms, ZEL3Variables& mirror, Sweep& onGraph, CommandExchange& exchange,
               FileOps& files, const Session& session);

    /// Where the traces of a recording go; empty while none runs. A file dialog that is used
    /// meanwhile does not turn the recording aside.
    std::string RecordingFileName;

    /// Refused in words while the trace on the graph is incomplete.
    void SaveCurrentView_Click();
    /// "trace" or "power"; any other word does nothing.
    void SaveView(const std::string& kind);
    void SaveTraceView(bool withHeader);
    /// Lines of the power log: the last power text, and the last VSWR text where the sensor reads
    /// the reflection as well.
    void savePowerValues();

    void WriteViewHeader(OutputFile& file, bool withHeader);
    /// A row a point: x and value; a row a pair with the auto peak detector.
    void WriteViewData(OutputFile& file);
    /// A failure is reported in a box and ends a recording.
    void WriteFooterAndCloseFileZELViewFormat(OutputFile& file);

    // The older log format, which nothing writes any more.
    void WriteLogHeader(OutputFile& file);
    void WriteFooterAndCloseFile(OutputFile& file);

    FileOps& files() { return files_; }

  private:
    OutputFile target() const;
    void save(const std::string& kind);
    void bandwidth(const char* word);
    void finish(OutputFile& file);
    std::string nowText() const { return session_.clock.dateTimeText(session_.clock.date()); }

    Forms& forms_;
    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    Sweep& onGraph_;
    CommandExchange& exchange_;
    FileOps& files_;
    Session session_;
    bool fromMenu_ = false;
    Handlers handlers_;
};

}  // namespace zel
