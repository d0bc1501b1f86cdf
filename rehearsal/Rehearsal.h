#pragma once
// A script run before its time: in virtual time, on a simulated instrument, without writing a file.

#include <cstddef>
#include <string>
#include <vector>

#include "platform/Files.h"
#include "platform/MessageBox.h"
#include "shell/Program.h"

namespace zel {

struct RehearsalSetup {
    std::string script;  ///< its file
    std::string folder;  ///< relative names of the script stand for files in here
    std::string output;  ///< a result file that was chosen before; empty without one
    int baud = 57600;    ///< of the line that the script will run on
};

struct LineReport {
    int line = 0;  ///< as an editor counts, from 1
    std::string text;
};

struct FileReport {
    std::string name;
    const char* fate = "";  ///< "new", "extended" or "replaced"
};

struct RehearsalReport {
    std::vector<LineReport> findings;  ///< in the order of the lines
    std::vector<FileReport> files;     ///< in the order of the first writing
    double seconds = 0;
    std::size_t bytes = 0;  ///< both ways
    double load = 0;        ///< percent of what the line can carry in that time
    /// A line is ignored or refused, a loop has no end, the run does not reach its end.
    bool wrong() const { return !findings.empty(); }
};

RehearsalReport rehearse(const RehearsalSetup& setup, FileService& files);
/// The report as `zelctl run --rehearse` prints it, a line each.
std::vector<std::string> reportLines(const RehearsalReport& report);
/// The script window's button shows the report of the open script in a box.
void offerRehearsal(Program& program, MessageBoxes& boxes, FileService& files);

}  // namespace zel
