#include "desktop/platform/SystemFiles.h"

#include <dirent.h>
#include <fcntl.h>
#include <string.h>
#include <sys/stat.h>
#include <sys/types.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <climits>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <filesystem>
#include <memory>
#include <random>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "desktop/platform/QtClock.h"
#include "platform/Files.h"

namespace zel {
namespace {

constexpr mode_t kNewFile = 0666;  // the user's mask takes its share
constexpr mode_t kPrivate = 0600;  // until the older file's mode is known
constexpr mode_t kModeBits = 07777;
constexpr int kMostTries = 100;
constexpr int kMostLinks = 40;
constexpr const char* kFolder = "it is a folder";
constexpr const char* kOther = "it is no regular file";

/// In English on every desk, as all other words of the program.
FileProblem problemOf(int error) {
    if (error == EISDIR) return kFolder;
    const char* words = ::strerrordesc_np(error);
    return words != nullptr ? words : "error " + std::to_string(error);
}

/// An open file of the system; closed at the end of its scope.
class Descriptor {
  public:
    Descriptor(const std::string& path, int flags, mode_t mode = 0) {
        do {
            fd_ = ::open(path.c_str(), flags | O_CLOEXEC | O_NOCTTY, mode);
        } while (fd_ < 0 && errno == EINTR);
    }
    ~Descriptor() { close(); }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    explicit operator bool() const { return fd_ >= 0; }
    int get() const { return fd_; }
    /// 0, or the error that the system found at the last moment.
    int close() {
        if (fd_ < 0) return 0;
        const int result = ::close(std::exchange(fd_, -1));
        return result == 0 || errno == EINTR ? 0 : errno;
    }

  private:
    int fd_ = -1;
};

/// 0 when the system has all bytes, else the error.
int writeAll(int fd, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t written = ::write(fd, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR) continue;
        if (written <= 0) return written == 0 ? EIO : errno;
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
    return 0;
}

FileKind kindOf(mode_t mode) {
    if (S_ISREG(mode)) return FileKind::Regular;
    return S_ISDIR(mode) ? FileKind::Folder : FileKind::Other;
}

/// The path behind all links, whether a file is there or not; empty for a circle.
std::string behindLinks(std::string path) {
    for (int links = 0; links < kMostLinks; ++links) {
        std::array<char, PATH_MAX> target{};
        const ssize_t length = ::readlink(path.c_str(), target.data(), target.size());
        if (length <= 0) return path;
        const std::string text(target.data(), static_cast<std::size_t>(length));
        // A relative target starts at the link's folder; an absolute one takes its place.
        path = (std::filesystem::path(path).parent_path() / text).string();
    }
    return {};
}

/// Gives the new file the older one's mode and, where the user may do that, its owner.
int takeOver(int fd, const struct stat& older) {
    [[maybe_unused]] const int ignored = ::fchown(fd, older.st_uid, older.st_gid);
    return ::fchmod(fd, older.st_mode & kModeBits) == 0 ? 0 : errno;
}

/// A write to what takes bytes slowly waits for it.
void letWait(int fd) { ::fcntl(fd, F_SETFL, ::fcntl(fd, F_GETFL) & ~O_NONBLOCK); }

class SystemReader : public FileReader {
  public:
    SystemReader(std::unique_ptr<Descriptor> file, std::uint64_t size)
        : file_(std::move(file)), size_(size) {}
    std::uint64_t size() const override { return size_; }
    std::size_t read(std::span<char> buffer, FileProblem& problem) override {
        std::size_t got = 0;
        while (got < buffer.size()) {
            const ssize_t n = ::read(file_->get(), buffer.data() + got, buffer.size() - got);
            if (n < 0 && errno == EINTR) continue;
            if (n < 0) problem = problemOf(errno);
            if (n <= 0) break;
            got += static_cast<std::size_t>(n);
        }
        return got;
    }

  private:
    std::unique_ptr<Descriptor> file_;
    std::uint64_t size_;
};

}  // namespace

std::string SystemFiles::randomEnding() {
    constexpr std::string_view kLetters = "abcdefghijklmnopqrstuvwxyz0123456789";
    constexpr int kLength = 10;
    std::random_device random;
    std::string ending;
    for (int i = 0; i < kLength; ++i) ending += kLetters[random() % kLetters.size()];
    return ending;
}

FileStatus SystemFiles::stat(const std::string& path) {
    struct stat found {};
    if (::stat(path.c_str(), &found) != 0) return {};
    FileStatus status;
    status.kind = kindOf(found.st_mode);
    if (status.isRegular()) status.size = static_cast<std::uint64_t>(found.st_size);
    constexpr double kNanos = 1e9;
    status.modified =
        QtClock::dateOf(found.st_mtim.tv_sec, static_cast<double>(found.st_mtim.tv_nsec) / kNanos);
    return status;
}

std::vector<std::string> SystemFiles::list(const std::string& folder) {
    // Names alone: a folder of a hundred thousand files is read while a window waits.
    std::vector<std::string> names;
    DIR* entries = ::opendir(folder.c_str());
    if (entries == nullptr) return names;
    while (const dirent* entry = ::readdir(entries)) {
        const std::string_view name(entry->d_name);
        if (name != "." && name != "..") names.emplace_back(name);
    }
    ::closedir(entries);
    return names;
}

std::unique_ptr<FileReader> SystemFiles::open(const std::string& path, FileProblem& problem) {
    problem.clear();
    // Opening a pipe would wait for its other end.
    auto file = std::make_unique<Descriptor>(path, O_RDONLY | O_NONBLOCK);
    if (!*file) {
        const int error = errno;
        // A socket cannot be opened at all.
        problem = error == ENXIO || stat(path).kind == FileKind::Other ? kOther : problemOf(error);
        return nullptr;
    }
    struct stat found {};
    if (::fstat(file->get(), &found) != 0) {
        problem = problemOf(errno);
    } else if (S_ISDIR(found.st_mode)) {
        problem = kFolder;
    } else if (!S_ISREG(found.st_mode)) {
        problem = kOther;
    }
    if (!problem.empty()) return nullptr;
    return std::make_unique<SystemReader>(std::move(file),
                                          static_cast<std::uint64_t>(found.st_size));
}

FileProblem SystemFiles::append(const std::string& path, std::string_view bytes) {
    Descriptor file(path, O_WRONLY | O_APPEND | O_CREAT | O_NONBLOCK, kNewFile);
    if (!file) return problemOf(errno);
    struct stat before {};
    if (::fstat(file.get(), &before) != 0) return problemOf(errno);
    letWait(file.get());
    int error = writeAll(file.get(), bytes);
    // A piece would spoil what follows it. Where even that fails, the first error says why.
    if (error != 0 && S_ISREG(before.st_mode)) [[maybe_unused]]
        const int cut = ::ftruncate(file.get(), before.st_size);
    const int closed = file.close();
    if (error == 0) error = closed;
    return error == 0 ? FileProblem() : problemOf(error);
}

FileProblem SystemFiles::throughTemporary(const std::string& target, std::string_view bytes,
                                          const struct stat* older) {
    int error = EEXIST;
    for (int attempt = 0; attempt < kMostTries && error == EEXIST; ++attempt) {
        const std::filesystem::path whole(target);
        const std::string name =
            (whole.parent_path() / ("." + whole.filename().string() + "." + ending_())).string();
        // The name must be free: whatever stands there, a link too, is left alone.
        Descriptor file(name, O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW,
                        older ? kPrivate : kNewFile);
        error = file ? 0 : errno;
        if (!file) continue;
        error = writeAll(file.get(), bytes);
        if (error == 0 && older != nullptr) error = takeOver(file.get(), *older);
        // Otherwise a loss of power could leave the new name with nothing behind it.
        if (error == 0 && ::fsync(file.get()) != 0) error = errno;
        const int closed = file.close();
        if (error == 0) error = closed;
        if (error == 0 && std::rename(name.c_str(), target.c_str()) != 0) error = errno;
        if (error != 0) ::unlink(name.c_str());
        if (error != 0) break;
    }
    return error == 0 ? FileProblem() : problemOf(error);
}

FileProblem SystemFiles::replace(const std::string& path, std::string_view bytes) {
    struct stat found {};
    const bool there = ::stat(path.c_str(), &found) == 0;
    if (!there && errno != ENOENT) return problemOf(errno);
    if (there && S_ISDIR(found.st_mode)) return kFolder;
    if (there && !S_ISREG(found.st_mode)) {
        Descriptor device(path, O_WRONLY | O_NONBLOCK);
        if (!device) return problemOf(errno);
        letWait(device.get());
        const int error = writeAll(device.get(), bytes);
        return error == 0 ? FileProblem() : problemOf(error);
    }
    // A file that may not be written is not replaced either, though the folder would allow it.
    if (there && ::access(path.c_str(), W_OK) != 0) return problemOf(errno);
    const std::string target = behindLinks(path);
    if (target.empty()) return problemOf(ELOOP);
    return throughTemporary(target, bytes, there ? &found : nullptr);
}

FileProblem SystemFiles::create(const std::string& path, std::string_view bytes) {
    Descriptor file(path, O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW, kNewFile);
    if (!file) return problemOf(errno);
    int error = writeAll(file.get(), bytes);
    const int closed = file.close();
    if (error == 0) error = closed;
    if (error == 0) return {};
    ::unlink(path.c_str());
    return problemOf(error);
}

FileProblem SystemFiles::remove(const std::string& path) {
    return ::unlink(path.c_str()) == 0 ? FileProblem() : problemOf(errno);
}

}  // namespace zel
