#include "files/OutputFile.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <memory>
#include <system_error>

namespace zel {
namespace {

namespace fs = std::filesystem;

struct Closer {
    void operator()(std::FILE* file) const { std::fclose(file); }
};
using File = std::unique_ptr<std::FILE, Closer>;

/// 0 when all of the text is with the system, else the error.
int writeAll(const char* path, const char* mode, const std::string& text, bool& opened) {
    errno = 0;
    File file(std::fopen(path, mode));
    opened = file != nullptr;
    if (!opened) return errno != 0 ? errno : EIO;
    const bool written = std::fwrite(text.data(), 1, text.size(), file.get()) == text.size() &&
                         std::fflush(file.get()) == 0;
    const int failure = written ? 0 : errno;
    errno = 0;
    const bool closed = std::fclose(file.release()) == 0;
    if (!written) return failure != 0 ? failure : EIO;
    return closed ? 0 : (errno != 0 ? errno : EIO);
}

}  // namespace

std::string writeProblem(const std::string& path, int errorNumber) {
    return "The file " + path +
           " cannot be written: " + std::generic_category().message(errorNumber);
}

std::string OutputFile::append() const {
    std::error_code missing;
    const auto before = fs::file_size(path_, missing);
    bool opened = false;
    const int failure = writeAll(path_.c_str(), "ab", text_, opened);
    if (failure == 0) return {};
    if (!missing) {
        std::error_code ignored;
        fs::resize_file(path_, before, ignored);  // a piece of a trace would spoil the rest
    }
    return writeProblem(path_, failure);
}

std::string OutputFile::replace() const {
    std::error_code ignored;
    bool opened = false;
    const bool plain = !fs::exists(path_, ignored) ||
                       (fs::is_regular_file(path_, ignored) && !fs::is_symlink(path_, ignored));
    if (plain) {
        const std::string beside = path_ + ".part";
        const int failure = writeAll(beside.c_str(), "wb", text_, opened);
        if (failure == 0) {
            std::error_code refused;
            fs::rename(beside, path_, refused);
            if (!refused) return {};
        }
        if (opened) fs::remove(beside, ignored);
        if (opened && failure != 0) return writeProblem(path_, failure);
    }
    // A device, a link, or a folder that takes no further file.
    const int failure = writeAll(path_.c_str(), "wb", text_, opened);
    return failure == 0 ? std::string() : writeProblem(path_, failure);
}

std::string OutputFile::close() {
    std::string problem = mode_ == Mode::Append ? append() : replace();
    text_.clear();
    return problem;
}

}  // namespace zel
