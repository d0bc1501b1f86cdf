#pragma once
// Starts programs, and the instrument simulator as a child that ends with this program.

#include <QProcess>
#include <QString>
#include <QTimer>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "desktop/platform/DesktopLauncher.h"

namespace zel {

/// The simulator serves a pseudo terminal, to which a link in the runtime folder of the user leads.
class SimulatorChild : public DesktopLauncher {
  public:
    /// In the name of the link.
    static constexpr const char* kLinkName = "zelremote-simulator-";

    SimulatorChild();
    ~SimulatorChild() override;

    bool start(const std::string& path, const std::vector<std::string>& arguments) override;
    bool runs() const;
    /// The device to connect to.
    const QString& link() const { return link_; }

    /// The device is there; also at a start while it runs already.
    std::function<void()> ready;
    /// It could not be started or has ended by itself; the text says why.
    std::function<void(const QString&)> ended;

  private:
    bool startChild(const QString& path);
    void look();
    void report(const QString& why);

    std::unique_ptr<QProcess> child_;
    QString link_;
    QTimer poll_;
    int looks_ = 0;
};

}  // namespace zel
