#include "desktop/platform/FolderThread.h"

#include <chrono>
#include <condition_variable>
#include <exception>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <system_error>
#include <thread>
#include <utility>

#include "desktop/platform/SystemFiles.h"
#include "platform/FolderFiles.h"

namespace zel {
namespace {

/// What the thread and the program share; it lives as long as one of them needs it.
struct Shared {
    std::mutex mutex;
    std::condition_variable done;
    std::optional<FolderFiles> found;
};

void read(const std::string& folder, Shared& shared) {
    FolderFiles found;
    try {
        SystemFiles files;
        found = filesOf(files, folder);
    } catch (const std::exception&) {
        found = {};  // as a folder that cannot be read
    }
    const std::lock_guard lock(shared.mutex);
    shared.found = std::move(found);
    shared.done.notify_all();
}

class ThreadReading : public FolderReading {
  public:
    explicit ThreadReading(const std::string& folder) : shared_(std::make_shared<Shared>()) {
        try {
            std::thread([shared = shared_, folder] { read(folder, *shared); }).detach();
        } catch (const std::system_error&) {
            read(folder, *shared_);  // no thread is to be had
        }
    }
    const FolderFiles* result(int ms) override {
        std::unique_lock lock(shared_->mutex);
        const bool done = shared_->done.wait_for(lock, std::chrono::milliseconds(ms),
                                                 [this] { return shared_->found.has_value(); });
        return done ? &*shared_->found : nullptr;
    }

  private:
    std::shared_ptr<Shared> shared_;
};

}  // namespace

std::unique_ptr<FolderReading> readInThread(const std::string& folder) {
    return std::make_unique<ThreadReading>(folder);
}

}  // namespace zel
