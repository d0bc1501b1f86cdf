#include "console/Fronts.h"

#include <QApplication>
#include <QCoreApplication>
#include <QLoggingCategory>
#include <algorithm>

#include "ZELSim/InProcessPort.h"
#include "console/Address.h"
#include "desktop/graph/GraphImage.h"
#include "desktop/graph/SpectrogramPicture.h"
#include "desktop/graph/WaterfallImage.h"
#include "desktop/platform/Language.h"
#include "desktop/platform/QtPlatform.h"
#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/ScriptedServer.h"
#include "platform/virtual/ScriptedSocket.h"
#include "platform/virtual/VirtualTime.h"
#include "trace/ViewAnnotations.h"
#include "waterfall/PictureOptions.h"

namespace zel {
namespace {

constexpr double kAnswerSeconds = 0.0001;

class SilentDebugChannel : public DebugChannel {
  public:
    void output(const std::string&) override {}
};

class SimulatorFront : public Front {
  public:
    explicit SimulatorFront(const std::string& home) : folder_(QString::fromStdString(home)) {
        ports_.ports = {kSimulatorPort};
        tcpSocket_.connectsTo(SocketState::Error);  // there is no network in here
    }
    const Clock& clock() const override { return clock_; }
    Events& events() override { return events_; }
    QtSignals& endSignals() override { return signals_; }
    Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) override {
        return {clock_,      served,        boxes,     port_,  ports_,     tcpSocket_,
                serverPort_, serverSocket_, settings_, debug_, clipboard_, launcher_,
                startup_,    folder_,       dialogs,   files_, signals_};
    }

  private:
    QtSignals signals_;
    VirtualClock clock_;
    VirtualEvents events_{clock_};
    // Virtual time has to go on from one answer to the next also where no sweep is waited for.
    zelsim::InProcessPort port_{clock_, events_, {}, {.answering = kAnswerSeconds}};
    FixedPortList ports_;
    ScriptedSocket tcpSocket_{events_};
    zelsim::InProcessPort serverPort_{clock_, events_, {}, {.answering = kAnswerSeconds}};
    ScriptedServer serverSocket_{events_};
    QtApplicationFolder folder_;
    QtSettingsStore settings_{folder_};
    SilentDebugChannel debug_;
    MemoryClipboard clipboard_;
    MemoryLauncher launcher_;
    MemoryStartupFolder startup_;
    SystemFiles files_;
};

class PortFront : public Front {
  public:
    explicit PortFront(const std::string& home) : qt_(QString::fromStdString(home)) {}
    const Clock& clock() const override { return qt_.clock; }
    Events& events() override { return qt_.events; }
    QtSignals& endSignals() override { return qt_.endSignals; }
    Platform platform(Events& served, MessageBoxes& boxes, FileDialogs& dialogs) override {
        return {qt_.clock,       served,        boxes,          qt_.serialPort,
                qt_.serialPorts, qt_.tcpSocket, qt_.serverPort, qt_.serverSocket,
                qt_.settings,    qt_.debug,     clipboard_,     qt_.launcher,
                qt_.startup,     qt_.folder,    dialogs,        qt_.files,
                qt_.endSignals};
    }

  private:
    QtPlatform qt_;
    MemoryClipboard clipboard_;  // the system's needs a window
};

}  // namespace

struct ToolkitSession::Application {
    std::unique_ptr<QCoreApplication> object;
};

ToolkitSession::ToolkitSession(int& argc, char** argv, bool windows)
    : application_(std::make_unique<Application>()) {
    QCoreApplication::setApplicationName("ZELRemote");
    if (windows) {
        if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
        // A start without a session of the desktop has warnings that mean nothing here.
        QLoggingCategory::setFilterRules("default.warning=false");
        application_->object = std::make_unique<QApplication>(argc, argv);
        QLoggingCategory::setFilterRules({});
    } else {
        application_->object = std::make_unique<QCoreApplication>(argc, argv);
    }
    useEnglishMessages();
}

ToolkitSession::~ToolkitSession() = default;

std::unique_ptr<Front> makeSimulatorFront(const std::string& home) {
    return std::make_unique<SimulatorFront>(home);
}

std::unique_ptr<Front> makePortFront(const std::string& home) {
    return std::make_unique<PortFront>(home);
}

std::string drawGraphImage(Program& program, const std::string& file) {
    const ControllerForm& panel = program.forms().controller;
    QString problem;
    saveGraphImage(panel.CWGraph1, annotateView(panel, program.variables()),
                   QString::fromStdString(file), &problem);
    return problem.toStdString();
}

std::string writeGraphImage(Program& program, const std::string& file) {
    const std::string problem = drawGraphImage(program, file);
    return problem.empty() ? std::string() : "the image could not be written: " + problem;
}

std::string drawWaterfallImage(Program& program, const std::string& file) {
    QString problem;
    const WaterfallForm& form = program.forms().waterfall;
    saveWaterfallImage(form, pictureStyle(form), QString::fromStdString(file), &problem);
    return problem.toStdString();
}

std::string writeRowsImage(Program& program, const std::string& file, bool spectrogram) {
    WaterfallForm& form = program.forms().waterfall;
    QString problem;
    if (spectrogram) {
        saveSpectrogramImage(form, program.history(), QString::fromStdString(file), &problem);
    } else {
        // The design's view, whatever the user's own was, with the rows that there are.
        form.ViewWaterfall.Click();
        PictureStyle style;
        style.view = GraphView3D();
        int rows = 0;
        for (const GraphCurve3D& plot : form.Graph3D.plots()) rows += plot.level.empty() ? 0 : 1;
        style.depthRows = std::max(rows, 1);
        saveWaterfallImage(form, style, QString::fromStdString(file), &problem);
    }
    return problem.isEmpty() ? std::string()
                             : "the image could not be written: " + problem.toStdString();
}

}  // namespace zel
