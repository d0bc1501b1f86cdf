#pragma once
// Whole files as texts, and the words for a file that failed.

#include <cstdint>
#include <functional>
#include <optional>
#include <string>

#include "platform/Files.h"

namespace zel {

/// Called with the bytes read so far and the size of the file.
using ReadProgress = std::function<void(std::uint64_t done, std::uint64_t size)>;

/// The file's bytes; nothing, with `problem` set, where it cannot be read or holds more than
/// `limit`. Takes little more memory than the file.
std::optional<std::string> readFile(FileService& files, const std::string& path,
                                    std::uint64_t limit, FileProblem& problem,
                                    const ReadProgress& progress = {});

/// "The file NAME cannot be read: No such file or directory".
std::string readProblem(const std::string& path, const FileProblem& why);
/// "The file NAME cannot be written: No space left on device".
std::string writeProblem(const std::string& path, const FileProblem& why);
/// "118 kB": three digits at most before the unit, one after the point below ten.
std::string sizeText(std::uint64_t bytes);

}  // namespace zel
