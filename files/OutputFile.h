#pragma once
// A text file that is written in one piece: what a line too many would spoil stays as it was.

#include <string>
#include <string_view>
#include <utility>

#include "platform/Files.h"

namespace zel {

/// Lines gather in memory and reach the file in `close`, so that a failure halfway leaves either
/// the older file or the appended one without the piece.
class OutputFile {
  public:
    enum class Mode { Output, Append };

    OutputFile(FileService& files, std::string path, Mode mode)
        : files_(files), path_(std::move(path)), mode_(mode) {}

    const std::string& path() const { return path_; }
    /// Adds text and CR LF.
    void line(std::string_view text) {
        text_ += text;
        text_ += "\r\n";
    }
    std::string& text() { return text_; }
    /// Writes what was gathered. What went wrong, for a user; else an empty text.
    std::string close();

  private:
    FileService& files_;
    std::string path_;
    Mode mode_;
    std::string text_;
};

}  // namespace zel
