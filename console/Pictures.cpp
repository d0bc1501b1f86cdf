#include "console/Pictures.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QProcess>
#include <QStandardPaths>
#include <algorithm>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/WaterfallForm.h"
#include "picture/PictureJson.h"
#include "platform/Graph3D.h"
#include "shell/Program.h"
#include "trace/ViewAnnotations.h"
#include "waterfall/PictureOptions.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr const char* kName = "zeldraw";
constexpr int kLongestMs = 60'000;

/// The last line: what stands before it is the toolkit's.
std::string lastLine(const QByteArray& text) {
    const QByteArray trimmed = text.trimmed();
    return trimmed.mid(trimmed.lastIndexOf('\n') + 1).toStdString();
}

std::string draw(const std::string& json, const std::string& file) {
    const std::string program = findDrawingProgram();
    if (program.empty()) return kNoDrawingProgram;
    QProcess drawing;
    drawing.setStandardOutputFile(QProcess::nullDevice());
    // A name that begins with a dash is a name all the same.
    drawing.start(QString::fromStdString(program), {"--", QString::fromStdString(file)});
    drawing.write(json.data(), static_cast<qint64>(json.size()));
    drawing.closeWriteChannel();
    if (!drawing.waitForFinished(kLongestMs)) {
        const bool failed = drawing.error() == QProcess::FailedToStart;
        drawing.kill();
        drawing.waitForFinished();
        return program + (failed ? " cannot be started" : " did not end within a minute");
    }
    if (drawing.exitStatus() != QProcess::NormalExit) return program + " broke off";
    if (drawing.exitCode() == 0) return {};
    const std::string problem = lastLine(drawing.readAllStandardError());
    return problem.empty() ? program + " failed" : problem;
}

std::string inWords(const std::string& problem) {
    return problem.empty() ? std::string() : "the image could not be written: " + problem;
}

}  // namespace

const char* const kNoDrawingProgram =
    "pictures are drawn by the program zeldraw, which is neither beside zelctl nor in the PATH: "
    "install the package zelremote-draw";

std::string findDrawingProgram() {
    const QString own = QCoreApplication::applicationDirPath();
    QString found = QStandardPaths::findExecutable(kName, {own});
    if (found.isEmpty()) found = QStandardPaths::findExecutable(kName);
    return found.toStdString();
}

std::string drawGraphImage(Program& program, const std::string& file) {
    const ControllerForm& panel = program.forms().controller;
    return draw(
        graphJson(panel.CWGraph1, annotateSweep(panel, program.variables(), program.sweep())),
        file);
}

std::string writeGraphImage(Program& program, const std::string& file) {
    return inWords(drawGraphImage(program, file));
}

std::string drawWaterfallImage(Program& program, const std::string& file) {
    const WaterfallForm& form = program.forms().waterfall;
    return draw(waterfallJson(form, pictureStyle(form)), file);
}

std::string writeRowsImage(Program& program, const std::string& file, bool spectrogram) {
    WaterfallForm& form = program.forms().waterfall;
    if (spectrogram) return inWords(draw(spectrogramJson(form, program.history()), file));
    // The design's view, whatever the user's own was, with the rows that there are.
    form.ViewWaterfall.Click();
    PictureStyle style;
    style.view = GraphView3D();
    int rows = 0;
    for (const GraphCurve3D& plot : form.Graph3D.plots()) rows += plot.level.empty() ? 0 : 1;
    style.depthRows = std::max(rows, 1);
    return inWords(draw(waterfallJson(form, style), file));
}

}  // namespace zel
