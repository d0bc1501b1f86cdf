#include "support/FileText.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>

#include "platform/Files.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr std::size_t kChunk = std::size_t{4} * 1024 * 1024;
constexpr std::size_t kLeastRead = 4096;

FileProblem tooLarge(std::uint64_t size, std::uint64_t limit) {
    return "it has " + sizeText(size) + ", and the limit is " + sizeText(limit);
}

}  // namespace

std::optional<std::string> readFile(FileService& files, const std::string& path,
                                    std::uint64_t limit, FileProblem& problem,
                                    const ReadProgress& progress) {
    const std::unique_ptr<FileReader> file = files.open(path, problem);
    if (!file) return std::nullopt;
    const std::uint64_t size = file->size();
    if (size > limit) {
        problem = tooLarge(size, limit);
        return std::nullopt;
    }
    std::string bytes;
    bytes.reserve(size + kLeastRead);  // the last read finds the end
    for (bool more = true; more;) {
        const std::size_t before = bytes.size();
        const std::size_t left = size > before ? static_cast<std::size_t>(size) - before : 0;
        const std::size_t wanted = std::min(kChunk, std::max(left, kLeastRead));
        bytes.resize(before + wanted);
        const std::size_t got = file->read(std::span(bytes.data() + before, wanted), problem);
        if (!problem.empty()) return std::nullopt;
        bytes.resize(before + got);
        more = got == wanted;
        // A file may grow while it is read, and some files do not know their size.
        if (bytes.size() > limit) {
            problem = tooLarge(bytes.size(), limit);
            return std::nullopt;
        }
        if (progress) progress(bytes.size(), std::max<std::uint64_t>(size, bytes.size()));
    }
    return bytes;
}

std::string readProblem(const std::string& path, const FileProblem& why) {
    return "The file " + path + " cannot be read: " + why;
}

std::string writeProblem(const std::string& path, const FileProblem& why) {
    return "The file " + path + " cannot be written: " + why;
}

std::string sizeText(std::uint64_t bytes) {
    constexpr const char* kUnits[] = {" B", " kB", " MB", " GB"};
    auto size = static_cast<double>(bytes);
    std::size_t unit = 0;
    while (size >= 1000 && unit < 3) size /= 1000, ++unit;
    return formatPattern(size, size < 10 && unit > 0 ? "0.0" : "0") + kUnits[unit];
}

}  // namespace zel
