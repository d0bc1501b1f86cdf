#pragma once
// What stands between the program and the front's services: boxes that keep quiet, settings that
// cannot be stored, and the record of what goes over the lines.

#include <functional>
#include <optional>
#include <string>

#include "platform/MessageBox.h"
#include "platform/Platform.h"
#include "platform/Services.h"
#include "support/RecordedPort.h"
#include "support/SessionLog.h"

namespace zel {

/// Shows the boxes of the front, but for those without a choice while `quiet` is true.
class QuietBoxes : public MessageBoxes {
  public:
    explicit QuietBoxes(MessageBoxes& boxes) : boxes_(boxes) {}
    std::function<bool()> quiet;

    BoxAnswer show(const Box& box) override;
    std::optional<std::string> prompt(const std::string& text, const std::string& title,
                                      const std::string& preset) override {
        return boxes_.prompt(text, title, preset);
    }

  private:
    MessageBoxes& boxes_;
};

/// Settings whose first failure is reported in a box; the program goes on without them.
class ReportedSettings : public SettingsStore {
  public:
    ReportedSettings(SettingsStore& settings, MessageBoxes& boxes)
        : settings_(settings), boxes_(boxes) {}

    std::string get(const std::string& application, const std::string& section,
                    const std::string& key, const std::string& fallback) override {
        return settings_.get(application, section, key, fallback);
    }
    bool set(const std::string& application, const std::string& section, const std::string& key,
             const std::string& value) override;
    std::string place() override { return settings_.place(); }

  private:
    SettingsStore& settings_;
    MessageBoxes& boxes_;
    bool reported_ = false;
};

/// The platform of a front with these in their places, and with its lines recorded.
struct Guards {
    explicit Guards(const Platform& front);

    QuietBoxes boxes;
    ReportedSettings settings;
    SessionLog log;
    RecordedPort port;
    RecordedSocket socket;
    RecordedPort serverPort;
    Platform platform;
};

}  // namespace zel
