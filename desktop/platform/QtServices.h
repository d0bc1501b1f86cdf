#pragma once
// The small services of the platform that need no window.

#include <QString>
#include <string>
#include <vector>

#include "platform/Files.h"
#include "platform/Services.h"

namespace zel {

/// The folder of what belongs to the program: where it is installed with it, else beside the
/// program.
std::string companionFolder();

/// `home` when it is not empty, else $ZELREMOTE_HOME, else the user's application data folder. It
/// is made when it is missing.
class QtApplicationFolder : public ApplicationFolder {
  public:
    explicit QtApplicationFolder(const QString& home = {});
    std::string path() override { return path_; }
    std::string programPath() override { return companionFolder(); }

  private:
    std::string path_;
};

/// One ini file in the application's folder.
class QtSettingsStore : public SettingsStore {
  public:
    QtSettingsStore(ApplicationFolder& folder, FileService& files);
    std::string get(const std::string& application, const std::string& section,
                    const std::string& key, const std::string& fallback) override;
    bool set(const std::string& application, const std::string& section, const std::string& key,
             const std::string& value) override;
    std::string place() override { return file_; }

  private:
    FileService& files_;
    std::string file_;
};

/// The logging category "zelremote.link", silent unless QT_LOGGING_RULES switches it on.
class QtDebugChannel : public DebugChannel {
  public:
    void output(const std::string& text) override;
};

/// Starts programs; a document is opened by nothing.
class QtLauncher : public Launcher {
  public:
    bool start(const std::string& path, const std::vector<std::string>& arguments) override;
};

/// Desktop entries in the user's autostart folder.
class QtStartupFolder : public StartupFolder {
  public:
    bool createLink(const std::string& linkName, const std::string& argument) override;
    bool removeLink(const std::string& linkName) override;
};

}  // namespace zel
