#pragma once
// Shows saved files on the graph: one view, a series of them, a log of the older format.

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

#include "files/FieldList.h"
#include "files/FileOps.h"
#include "files/LoadedRows.h"
#include "files/Playback.h"
#include "files/SeriesFrames.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "trace/GraphScaling.h"
#include "trace/Interlock.h"
#include "trace/Sweep.h"
#include "trace/TraceConversion.h"
#include "trace/TraceOnGraph.h"

namespace zel {

class ViewReader {
  public:
    /// Connects the menu entry and the front's request to open a file.
    /// The sweep of `onGraph` becomes each trace that is shown.
    ViewReader(Forms& forms, ZEL3Variables& mirror, const TraceOnGraph& onGraph, FileOps& files,
               const Interlock& interlock);

    void LoadData_Click();
    /// Reads and shows a file; what cannot be read is reported in a box. Nothing happens while
    /// another file loads.
    void loadFile(const std::string& path);
    /// `text` holds the whole file, its fields apart by CR (a semicolon counts as one); `fileTime`
    /// is day and time of the file, `rowNumber` the waterfall's row to go on with, 0 for a file
    /// that starts again.
    void LoadTheData(const std::string& text, const std::string& fileTime, std::int16_t rowNumber);
    void LoadTheDataForOlderVersions(const std::string& text);

    /// A file was read; its path.
    Event<const std::string&> FileLoaded;

  private:
    /// What the header said, and where the rows begin.
    struct Header {
        bool zeroSpan = false;
        int mark = -1;  ///< entry of the data mark
        std::string_view markWord;
        std::string rowLabel;  ///< of the trace at hand
        bool series = false;
    };

    Header readHeader(const std::string& text, const FieldList& lines, const std::string& fileTime);
    void takeRange(std::string_view entry);
    void rememberShown(const FieldList& lines, int end);
    using Text = std::shared_ptr<const std::string>;
    void takeView(const Text& text, const std::string& fileTime, std::int16_t rowNumber);
    /// Locks the panel as a view does, runs the work and unlocks it.
    void underStop(const std::function<void()>& work);
    void showSeries(const std::shared_ptr<SeriesFrames>& frames, Header header, int first);
    bool showFrame(SeriesFrames& frames, Header& header, int index);
    /// The rows of the waterfall up to that trace, which is left on the graph.
    bool showUpTo(SeriesFrames& frames, Header& header, int index);
    void playFrom(int index);
    void jumpTo(int index);
    void showTrace(const Header& header);
    void keepAsSweep(double increment);
    void spread(bool zeroSpan, double first, double last);
    void progress(const std::string& what, double part);

    Forms& forms_;
    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    Sweep& onGraph_;
    FileOps& files_;
    GraphScaling& scaling_;
    const Interlock& interlock_;
    const Clock& clock_;
    Events& events_;
    MessageBoxes& boxes_;
    const TraceConversion& conversion_;
    LoadedRows rows_;
    Playback playback_;
    std::string name_;  ///< of the file, without its folder
    bool loading_ = false;
    Handlers handlers_;
};

}  // namespace zel
