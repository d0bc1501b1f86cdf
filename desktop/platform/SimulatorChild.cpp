#include "desktop/platform/SimulatorChild.h"

#include <linux/prctl.h>
#include <signal.h>
#include <sys/prctl.h>

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QStandardPaths>
#include <memory>
#include <string>
#include <vector>

#include "desktop/platform/DesktopLauncher.h"

namespace zel {
namespace {

constexpr int kLookMs = 50;
constexpr int kMostLooks = 100;
constexpr int kEndMs = 1000;

QString runtimeFolder() {
    const QString folder = QStandardPaths::writableLocation(QStandardPaths::RuntimeLocation);
    return folder.isEmpty() ? QDir::tempPath() : folder;
}

}  // namespace

SimulatorChild::SimulatorChild() {
    QObject::connect(&poll_, &QTimer::timeout, &poll_, [this] { look(); });
}

SimulatorChild::~SimulatorChild() {
    poll_.stop();
    if (!child_) return;
    QObject::disconnect(child_.get(), nullptr, nullptr, nullptr);
    child_->terminate();
    if (!child_->waitForFinished(kEndMs)) child_->kill();
    child_->waitForFinished(kEndMs);
    QFile::remove(link_);
}

bool SimulatorChild::start(const std::string& path, const std::vector<std::string>& arguments) {
    const QString file = QString::fromStdString(path);
    if (QFileInfo(file).fileName() != "ZELSim") return DesktopLauncher::start(path, arguments);
    if (!runs()) return startChild(file);
    if (ready) ready();
    return true;
}

bool SimulatorChild::runs() const {
    return child_ && child_->state() == QProcess::Running && QFileInfo(link_).isSymLink();
}

bool SimulatorChild::startChild(const QString& path) {
    link_ = runtimeFolder() + "/" + kLinkName + QString::number(QCoreApplication::applicationPid());
    child_ = std::make_unique<QProcess>();
    // Should this program be killed, the child ends as well.
    child_->setChildProcessModifier([] { prctl(PR_SET_PDEATHSIG, SIGTERM); });
    child_->setStandardOutputFile(QProcess::nullDevice());
    QObject::connect(child_.get(), &QProcess::finished, &poll_,
                     [this] { report(QObject::tr("The instrument simulator has ended")); });
    child_->start(path, {"--pty", "--link", link_});
    if (!child_->waitForStarted(kEndMs)) {
        report(QFileInfo::exists(path)
                   ? QObject::tr("The instrument simulator cannot be started: %1")
                         .arg(child_->errorString())
                   : QObject::tr("The instrument simulator is not installed: there is no %1")
                         .arg(path));
        return false;
    }
    looks_ = 0;
    poll_.start(kLookMs);
    return true;
}

void SimulatorChild::look() {
    if (runs()) {
        poll_.stop();
        if (ready) ready();
    } else if (++looks_ >= kMostLooks) {
        report(QObject::tr("The instrument simulator does not come up"));
    }
}

void SimulatorChild::report(const QString& why) {
    poll_.stop();
    if (ended) ended(why);
}

}  // namespace zel
