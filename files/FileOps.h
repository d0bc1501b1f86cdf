#pragma once
// The file dialogs of the panel and the reading of whole files.

#include <cstdint>
#include <optional>
#include <string>

#include "forms/ControllerForm.h"
#include "platform/Clock.h"
#include "platform/Files.h"
#include "platform/Services.h"
#include "support/FileText.h"

namespace zel {

/// All dialogs return the chosen path, or the empty text when cancelled.
class FileOps {
  public:
    FileOps(ControllerForm& panel, FileDialogs& dialogs, ApplicationFolder& folder,
            FileService& files, const Clock& clock)
        : panel_(panel), dialogs_(dialogs), folder_(folder), files_(files), clock_(clock) {}

    std::string LastDialogFileName;  ///< what the last dialog gave; empty if none yet
    std::string LastOpenFolder;      ///< where the open dialog begins; empty at the start

    /// `filterIndex` counts from 1: all files, text, data, CSV.
    std::string ShowSaveDataDialog(int filterIndex);
    /// The ending of the kind that is offered first. A name without an ending gets it.
    std::string ShowSaveImageDialog(const std::string& extension);
    std::string ShowOpenDataDialog(int filterIndex);
    /// The file's text; bytes that are no UTF-8 count as Windows-1252. Throws
    /// std::runtime_error with a text for the user when the file cannot be read or is larger
    /// than `kLargestFile`. An empty path or file gives the empty text. Takes less memory than
    /// three times the file.
    std::string ReadWholeFile(const std::string& path, const ReadProgress& progress = {}) const;
    /// Day and time at which the last dialog's file was written; " " without one.
    std::string LastFileDateTime() const;
    /// The same of the file of that path; " " when it is not there.
    std::string dateTimeOf(const std::string& path) const;
    /// Takes a name as if a dialog had given it.
    void note(const std::string& path);
    FileService& service() const { return files_; }

    static constexpr int kCsvFilter = 4;
    static constexpr std::uint64_t kLargestFile = 1ULL << 30;  ///< 1 GiB

  private:
    std::string finish(const std::optional<std::string>& chosen);

    ControllerForm& panel_;
    FileDialogs& dialogs_;
    ApplicationFolder& folder_;
    FileService& files_;
    const Clock& clock_;
};

}  // namespace zel
