#pragma once
// The platform's small services, kept in memory and recorded.

#include <deque>
#include <map>
#include <optional>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "platform/SerialPort.h"
#include "platform/Services.h"

namespace zel {

class MemorySettings : public SettingsStore {
  public:
    using Key = std::tuple<std::string, std::string, std::string>;
    std::map<Key, std::string> values;
    bool works = true;  ///< false: nothing can be stored

    std::string get(const std::string& application, const std::string& section,
                    const std::string& key, const std::string& fallback) override {
        const auto found = values.find(Key{application, section, key});
        return found == values.end() ? fallback : found->second;
    }
    bool set(const std::string& application, const std::string& section, const std::string& key,
             const std::string& value) override {
        if (works) values[Key{application, section, key}] = value;
        return works;
    }
};

class MemoryDebugChannel : public DebugChannel {
  public:
    std::vector<std::string> lines;
    void output(const std::string& text) override { lines.push_back(text); }
};

class MemoryClipboard : public Clipboard {
  public:
    void setText(const std::string& text) override { text_ = text; }
    std::string text() override { return text_; }

  private:
    std::string text_;
};

class MemoryLauncher : public Launcher {
  public:
    struct Start {
        std::string path;
        std::vector<std::string> arguments;
    };
    std::vector<Start> starts;
    bool works = true;  ///< false: a start fails
    bool start(const std::string& path, const std::vector<std::string>& arguments) override {
        starts.push_back({path, arguments});
        return works;
    }
};

class MemoryStartupFolder : public StartupFolder {
  public:
    std::map<std::string, std::string> links;  ///< argument by name
    bool works = true;                         ///< false: links can be neither made nor removed
    bool createLink(const std::string& linkName, const std::string& argument) override {
        if (works) links[linkName] = argument;
        return works;
    }
    bool removeLink(const std::string& linkName) override {
        return works && links.erase(linkName) > 0;
    }
};

class FixedApplicationFolder : public ApplicationFolder {
  public:
    std::string folder;
    std::string programFolder;
    std::string path() override { return folder; }
    std::string programPath() override { return programFolder; }
};

/// A dialog gets the path that was queued; without one it is cancelled.
class QueuedFileDialogs : public FileDialogs {
  public:
    std::vector<FileDialogRequest> saves;
    std::vector<FileDialogRequest> opens;
    /// Nothing cancels the dialog.
    void answer(std::optional<std::string> path) { answers_.push_back(std::move(path)); }

    std::optional<std::string> save(const FileDialogRequest& request) override {
        saves.push_back(request);
        return next();
    }
    std::optional<std::string> open(const FileDialogRequest& request) override {
        opens.push_back(request);
        return next();
    }

  private:
    std::optional<std::string> next() {
        if (answers_.empty()) return std::nullopt;
        std::optional<std::string> path = std::move(answers_.front());
        answers_.pop_front();
        return path;
    }
    std::deque<std::optional<std::string>> answers_;
};

class FixedPortList : public SerialPortList {
  public:
    std::vector<std::string> ports;
    std::vector<std::string> names() override { return ports; }
};

}  // namespace zel
