#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>

#include "platform/Files.h"
#include "platform/virtual/VirtualPlatform.h"
#include "support/FileText.h"

namespace zel {
namespace {

/// A disk that gives a size of its own for each file.
struct MisjudgedFiles : VirtualFiles {
    struct Reader : FileReader {
        std::unique_ptr<FileReader> file;
        std::uint64_t shown = 0;

        std::uint64_t size() const override { return shown; }
        std::size_t read(std::span<char> buffer, FileProblem& problem) override {
            return file->read(buffer, problem);
        }
    };
    using VirtualFiles::VirtualFiles;
    std::uint64_t shown = 0;

    std::unique_ptr<FileReader> open(const std::string& path, FileProblem& problem) override {
        auto reader = std::make_unique<Reader>();
        reader->file = VirtualFiles::open(path, problem);
        reader->shown = shown;
        if (!reader->file) return nullptr;
        return reader;
    }
};

struct FileTextTest : ::testing::Test {
    VirtualPlatform platform;
    MisjudgedFiles files{platform.clock};
    FileProblem problem;

    /// A text of so many bytes, none like its neighbour.
    static std::string text(std::size_t size) {
        std::string bytes(size, '\0');
        for (std::size_t i = 0; i < size; ++i) bytes[i] = static_cast<char>('0' + i % 71);
        return bytes;
    }
};

TEST_F(FileTextTest, FileOfUnknownLength_IsReadToItsEnd) {
    for (const std::size_t size : {0U, 1U, 4095U, 4096U, 4097U, 8192U, 100'000U}) {
        files.put("/file", text(size));
        std::uint64_t last = 0;
        const auto bytes =
            readFile(files, "/file", 1'000'000, problem, [&](std::uint64_t got, std::uint64_t all) {
                EXPECT_LE(got, all);
                last = got;
            });
        ASSERT_TRUE(bytes) << problem;
        EXPECT_TRUE(*bytes == text(size)) << size << " " << bytes->size();
        EXPECT_EQ(last, size);
    }
}

TEST_F(FileTextTest, FileThatGrewSinceItsSizeWasAsked_IsReadToItsEnd) {
    files.shown = 5000;
    files.put("/file", text(20'000));
    const auto bytes = readFile(files, "/file", 20'000, problem);
    ASSERT_TRUE(bytes) << problem;
    EXPECT_TRUE(*bytes == text(20'000));
}

TEST_F(FileTextTest, FileThatIsShorterThanItsSize_EndsWhereItEnds) {
    files.shown = 50'000;
    files.put("/file", text(5000));
    const auto bytes = readFile(files, "/file", 50'000, problem);
    ASSERT_TRUE(bytes) << problem;
    EXPECT_TRUE(*bytes == text(5000));
}

TEST_F(FileTextTest, FileAboveTheLimit_IsRefusedWhateverItsSizeSays) {
    files.put("/file", text(20'001));
    EXPECT_FALSE(readFile(files, "/file", 20'000, problem));
    EXPECT_EQ(problem, "it has 20 kB, and the limit is 20 kB");
    files.shown = 3'000'000;
    EXPECT_FALSE(readFile(files, "/file", 20'000, problem));
    EXPECT_EQ(problem, "it has 3.0 MB, and the limit is 20 kB");
}

}  // namespace
}  // namespace zel
