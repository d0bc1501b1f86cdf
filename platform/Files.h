#pragma once
// The files of the machine: looked at, read, and written so that a failure loses nothing.

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace zel {

/// Why an action on a file failed, in words that can end a sentence ("No space left on device").
/// Empty when it did not fail.
using FileProblem = std::string;

enum class FileKind { None, Regular, Folder, Other };

/// What a path leads to; links are followed.
struct FileStatus {
    FileKind kind = FileKind::None;
    std::uint64_t size = 0;  ///< bytes of a regular file, else 0
    double modified = 0;     ///< time of the last write, as `Clock::date`; 0 where nothing is

    bool exists() const { return kind != FileKind::None; }
    bool isRegular() const { return kind == FileKind::Regular; }
};

/// A file that is being read from its beginning to its end.
class FileReader {
  public:
    virtual ~FileReader() = default;
    /// Bytes of the file when it was opened.
    virtual std::uint64_t size() const = 0;
    /// The next bytes. Returns how many came: fewer than the buffer holds at the end of the file
    /// or, with `problem` set, where reading failed.
    virtual std::size_t read(std::span<char> buffer, FileProblem& problem) = 0;
};

/// Paths are UTF-8. A relative path starts at the working folder.
class FileService {
  public:
    virtual ~FileService() = default;

    virtual FileStatus stat(const std::string& path) = 0;
    /// The names of a folder's entries in no certain order; none where it cannot be read.
    virtual std::vector<std::string> list(const std::string& folder) = 0;

    /// Opens a regular file for reading. Null, with `problem` set, for anything else: a folder, a
    /// pipe, a device, a file that may not be read.
    virtual std::unique_ptr<FileReader> open(const std::string& path, FileProblem& problem) = 0;
    /// Adds the bytes at the end of the file; a missing file is made. After a failure the
    /// file is as it was before.
    virtual FileProblem append(const std::string& path, std::string_view bytes) = 0;
    /// Gives the file these bytes in one step, by way of a temporary file in the same folder.
    /// After a failure the file is as it was before. The mode of an older file is kept; where the
    /// path is a link, the file that it points to is replaced. A device takes the bytes directly.
    virtual FileProblem replace(const std::string& path, std::string_view bytes) = 0;
    /// Makes a file of these bytes. Fails where the path exists, also as a link that points to
    /// nothing. After a failure there is no file.
    virtual FileProblem create(const std::string& path, std::string_view bytes) = 0;
    /// Deletes a file; a link itself, not what it points to.
    virtual FileProblem remove(const std::string& path) = 0;
};

}  // namespace zel
