// The file service on a real disk.

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <QTemporaryDir>
#include <array>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "desktop/platform/SystemFiles.h"

namespace zel {
namespace {

namespace fs = std::filesystem;

struct SystemFilesTest : ::testing::Test {
    std::string path(const char* name) const { return folder.filePath(name).toStdString(); }
    std::string write(const char* name, const std::string& text) const {
        std::ofstream(path(name), std::ios::binary) << text;
        return path(name);
    }
    std::string bytes(const char* name) const {
        std::ifstream in(path(name), std::ios::binary);
        return {std::istreambuf_iterator<char>(in), {}};
    }
    /// How many entries the folder holds, hidden ones too.
    std::ptrdiff_t entries() const {
        return std::distance(fs::directory_iterator(folder.path().toStdString()), {});
    }
    unsigned mode(const char* name) const {
        struct stat found {};
        EXPECT_EQ(::stat(path(name).c_str(), &found), 0);
        return found.st_mode & 07777U;
    }
    FileProblem whyNot(const std::string& name) {
        FileProblem problem;
        EXPECT_EQ(files.open(name, problem), nullptr);
        return problem;
    }

    QTemporaryDir folder;
    SystemFiles files;
};

/// No file of this process grows beyond a size.
class FileLimit {
  public:
    explicit FileLimit(rlim_t bytes) : handler_(std::signal(SIGXFSZ, SIG_IGN)) {
        getrlimit(RLIMIT_FSIZE, &before_);
        rlimit limit = before_;
        limit.rlim_cur = bytes;
        setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~FileLimit() {
        setrlimit(RLIMIT_FSIZE, &before_);
        std::signal(SIGXFSZ, handler_);
    }
    FileLimit(const FileLimit&) = delete;
    FileLimit& operator=(const FileLimit&) = delete;

  private:
    void (*handler_)(int);
    rlimit before_{};
};

TEST_F(SystemFilesTest, Replace_MakesAFileWithTheUsersMask) {
    const mode_t before = ::umask(027);
    EXPECT_EQ(files.replace(path("a"), "new"), "");
    ::umask(before);
    EXPECT_EQ(bytes("a"), "new");
    EXPECT_EQ(mode("a"), 0640U);
    EXPECT_EQ(entries(), 1);
}

TEST_F(SystemFilesTest, Replace_KeepsTheMode) {
    write("a", "older and longer");
    for (const unsigned kept : {0600U, 0664U, 0755U}) {
        ::chmod(path("a").c_str(), kept);
        EXPECT_EQ(files.replace(path("a"), "new"), "");
        EXPECT_EQ(mode("a"), kept);
    }
    EXPECT_EQ(bytes("a"), "new");
    EXPECT_EQ(entries(), 1);
}

TEST_F(SystemFilesTest, Replace_OfALink_ReplacesWhatItPointsTo) {
    fs::create_directory(path("sub"));
    write("sub/a", "old");
    fs::create_symlink("sub/a", path("link"));
    fs::create_symlink(path("link"), path("second"));
    EXPECT_EQ(files.replace(path("second"), "new"), "");
    EXPECT_EQ(bytes("sub/a"), "new");
    EXPECT_TRUE(fs::is_symlink(path("link")));
    EXPECT_TRUE(fs::is_symlink(path("second")));
    EXPECT_FALSE(fs::is_symlink(path("sub/a")));
}

TEST_F(SystemFilesTest, Replace_OfALinkToNothing_MakesTheFile) {
    fs::create_symlink("later", path("link"));
    EXPECT_EQ(files.replace(path("link"), "new"), "");
    EXPECT_EQ(bytes("later"), "new");
    EXPECT_TRUE(fs::is_symlink(path("link")));
}

TEST_F(SystemFilesTest, Replace_OfACircleOfLinks_IsRefused) {
    fs::create_symlink("q", path("p"));
    fs::create_symlink("p", path("q"));
    EXPECT_EQ(files.replace(path("p"), "new"), "Too many levels of symbolic links");
}

TEST_F(SystemFilesTest, TemporaryName_ThatIsALink_IsNotFollowed) {
    write("victim", "kept");
    fs::create_symlink("victim", path(".a.taken"));
    int calls = 0;
    SystemFiles traps([&calls] { return std::string(++calls < 3 ? "taken" : "free"); });
    EXPECT_EQ(traps.replace(path("a"), "new"), "");
    EXPECT_EQ(calls, 3);
    EXPECT_EQ(bytes("victim"), "kept");
    EXPECT_TRUE(fs::is_symlink(path(".a.taken")));
    EXPECT_EQ(bytes("a"), "new");
}

TEST_F(SystemFilesTest, TemporaryName_ThatIsNeverFree_EndsInWords) {
    write(".a.taken", "kept");
    SystemFiles traps([] { return std::string("taken"); });
    EXPECT_EQ(traps.replace(path("a"), "new"), "File exists");
    EXPECT_EQ(bytes(".a.taken"), "kept");
}

TEST_F(SystemFilesTest, Failures_LeaveTheOlderFileAndNothingBeside) {
    write("a", "older");
    const std::string large(5000, 'x');
    {
        const FileLimit limit(2000);
        EXPECT_EQ(files.replace(path("a"), large), "File too large");
        EXPECT_EQ(files.append(path("a"), large), "File too large");
        EXPECT_EQ(files.create(path("b"), large), "File too large");
    }
    EXPECT_EQ(bytes("a"), "older");
    EXPECT_EQ(entries(), 1);
}

TEST_F(SystemFilesTest, Append_GoesOnBehindLinksToo) {
    EXPECT_EQ(files.append(path("a"), "one"), "");
    fs::create_symlink("a", path("link"));
    EXPECT_EQ(files.append(path("link"), "two"), "");
    EXPECT_EQ(bytes("a"), "onetwo");
}

TEST_F(SystemFilesTest, Create_TakesNoPathThatIsThere) {
    write("a", "old");
    fs::create_symlink("nowhere", path("link"));
    EXPECT_EQ(files.create(path("a"), "new"), "File exists");
    EXPECT_EQ(files.create(path("link"), "new"), "File exists");
    EXPECT_EQ(files.create(path("b"), "new"), "");
    EXPECT_EQ(bytes("a"), "old");
    EXPECT_EQ(bytes("b"), "new");
    EXPECT_FALSE(fs::exists(path("nowhere")));
}

TEST_F(SystemFilesTest, Device_TakesTheBytes) {
    EXPECT_EQ(files.replace("/dev/full", "new"), "No space left on device");
    EXPECT_EQ(files.append("/dev/full", "new"), "No space left on device");
    EXPECT_EQ(files.replace("/dev/null", "new"), "");
    EXPECT_EQ(files.stat("/dev/null").kind, FileKind::Other);
}

TEST_F(SystemFilesTest, WhatIsNoRegularFile_IsNotRead) {
    ASSERT_EQ(::mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_EQ(whyNot(path("pipe")), "it is no regular file");
    EXPECT_EQ(whyNot("/dev/zero"), "it is no regular file");
    EXPECT_EQ(whyNot(folder.path().toStdString()), "it is a folder");
    EXPECT_EQ(whyNot(path("gone")), "No such file or directory");
}

TEST_F(SystemFilesTest, FolderOrMissingFolder_IsNotWritten) {
    EXPECT_EQ(files.replace(folder.path().toStdString(), "new"), "it is a folder");
    EXPECT_EQ(files.append(folder.path().toStdString(), "new"), "it is a folder");
    EXPECT_EQ(files.replace(path("gone/a"), "new"), "No such file or directory");
    EXPECT_EQ(files.create(path("gone/a"), "new"), "No such file or directory");
    EXPECT_EQ(files.append(path("gone/a"), "new"), "No such file or directory");
}

TEST_F(SystemFilesTest, FileThatMayNotBeWritten_IsNotReplacedEither) {
    if (::geteuid() == 0) GTEST_SKIP() << "root may write everything";
    write("a", "old");
    ::chmod(path("a").c_str(), 0400);
    EXPECT_EQ(files.replace(path("a"), "new"), "Permission denied");
    EXPECT_EQ(bytes("a"), "old");
}

TEST_F(SystemFilesTest, Open_ReadsToTheEnd) {
    write("a", "abcdef");
    FileProblem problem;
    const auto file = files.open(path("a"), problem);
    ASSERT_NE(file, nullptr);
    EXPECT_EQ(file->size(), 6U);
    std::array<char, 4> buffer{};
    EXPECT_EQ(file->read(buffer, problem), 4U);
    EXPECT_EQ(file->read(buffer, problem), 2U);
    EXPECT_EQ(buffer[1], 'f');
    EXPECT_EQ(file->read(buffer, problem), 0U);
    EXPECT_EQ(problem, "");
    EXPECT_EQ(files.stat(path("a")).size, 6U);
    EXPECT_EQ(files.list(folder.path().toStdString()), std::vector<std::string>{"a"});
    EXPECT_EQ(files.remove(path("a")), "");
    EXPECT_FALSE(files.stat(path("a")).exists());
}

}  // namespace
}  // namespace zel
