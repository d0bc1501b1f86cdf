#pragma once
// The platform's small services: settings, files to choose, clipboard, other programs, debug text.

#include <optional>
#include <string>
#include <vector>

namespace zel {

/// Per-user settings by application, section and key. An absent key gives the default.
class SettingsStore {
  public:
    virtual ~SettingsStore() = default;
    virtual std::string get(const std::string& application, const std::string& section,
                            const std::string& key, const std::string& fallback) = 0;
    /// False when the value could not be stored.
    virtual bool set(const std::string& application, const std::string& section,
                     const std::string& key, const std::string& value) = 0;
    /// Where the settings are, for a message; empty where there is no such place.
    virtual std::string place() { return {}; }
};

/// The link's debug channel: one text a call.
class DebugChannel {
  public:
    virtual ~DebugChannel() = default;
    virtual void output(const std::string& text) = 0;
};

class Clipboard {
  public:
    virtual ~Clipboard() = default;
    virtual void setText(const std::string& text) = 0;
    virtual std::string text() = 0;
};

class Launcher {
  public:
    virtual ~Launcher() = default;
    /// Starts a program or opens a document; false when that failed.
    virtual bool start(const std::string& path, const std::vector<std::string>& arguments) = 0;
    /// Opens the program's own help book at the topic of that context number; false where there is
    /// no viewer or no book.
    virtual bool showHelp(int /*context*/) { return false; }
};

/// The user's start-up folder.
class StartupFolder {
  public:
    virtual ~StartupFolder() = default;
    virtual bool createLink(const std::string& linkName, const std::string& argument) = 0;
    virtual bool removeLink(const std::string& linkName) = 0;
};

/// The files that the program calls its own.
class ApplicationFolder {
  public:
    virtual ~ApplicationFolder() = default;
    virtual std::string path() = 0;
    /// Where the program file and its companions are installed.
    virtual std::string programPath() = 0;
};

struct FileDialogRequest {
    std::string title;
    std::string filter;  ///< "Text (*.txt)|*.txt|..." pairs
    int filterIndex = 1;
    std::string folder;
    std::string fileName;
    bool promptOverwrite = false;
};

class FileDialogs {
  public:
    virtual ~FileDialogs() = default;
    /// The chosen path; nothing when cancelled.
    virtual std::optional<std::string> save(const FileDialogRequest& request) = 0;
    virtual std::optional<std::string> open(const FileDialogRequest& request) = 0;
};

}  // namespace zel
