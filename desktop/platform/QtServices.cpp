#include "desktop/platform/QtServices.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QLoggingCategory>
#include <QProcess>
#include <QSaveFile>
#include <QStandardPaths>
#include <string>
#include <vector>

#include "platform/Files.h"
#include "platform/Services.h"
#include "support/IniFile.h"

/// The linker takes the resources of a library only when they are asked for.
static void takeDefaults() { Q_INIT_RESOURCE(defaults); }

namespace zel {
namespace {

Q_LOGGING_CATEGORY(linkLog, "zelremote.link", QtWarningMsg)

/// The key in the application's section.
std::string settingsKey(const std::string& section, const std::string& key) {
    return section + "\\" + key;
}

/// The program with the window, which is beside the console's.
QString windowProgram() {
    const QFileInfo beside(QCoreApplication::applicationDirPath() + "/zelremote");
    return beside.isExecutable() ? beside.filePath() : QCoreApplication::applicationFilePath();
}

/// In the quotes of a command line of a desktop entry, whose own rules come after those of its
/// texts: a backslash is written four times.
QString entryText(QString text) {
    text.replace("\\", R"(\\\\)").replace("%", "%%");
    for (const char* mark : {"\"", "`", "$"}) text.replace(mark, QString(R"(\\)") + mark);
    return text;
}

QString autostartEntry(const std::string& linkName) {
    const QString name = QFileInfo(QString::fromStdString(linkName)).completeBaseName();
    const QString folder =
        QStandardPaths::writableLocation(QStandardPaths::ConfigLocation) + "/autostart";
    return folder + "/" + name + ".desktop";
}

/// The example scripts, on the first start; what is there already is the user's.
void copyExamples(const QString& from, const QString& folder) {
    constexpr const char* kScripts = "/specialMeas";
    const QDir source(from + "/defaults" + kScripts);
    if (QDir(folder + kScripts).exists() || !source.exists()) return;
    QDir().mkpath(folder + kScripts);
    for (const QString& name : source.entryList({"*.txt"}, QDir::Files))
        QFile::copy(source.filePath(name), folder + kScripts + "/" + name);
}

/// Does not wait for the disk, as copying does: a start would be slower by a tenth.
void writeDefault(const QByteArray& text, const QString& path) {
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly)) return;
    const bool whole = file.write(text) == text.size() && file.flush();
    file.close();
    if (!whole) file.remove();
}

/// A new folder gets the files that users may change; a file that is there stays. An empty one is
/// written again: a computer that lost its power after the first start leaves it so.
void fillFromDefaults(const QString& folder) {
    takeDefaults();
    const QDir defaults(":/defaults");
    for (const QString& name : defaults.entryList(QDir::Files)) {
        const QString path = folder + "/" + name;
        if (QFileInfo(path).size() > 0) continue;
        QFile source(defaults.filePath(name));
        if (source.open(QIODevice::ReadOnly)) writeDefault(source.readAll(), path);
    }
}

}  // namespace

QtApplicationFolder::QtApplicationFolder(const QString& home) {
    QString folder = home;
    if (folder.isEmpty()) folder = qEnvironmentVariable("ZELREMOTE_HOME");
    if (folder.isEmpty())
        folder =
            QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation) + "/ZELRemote";
    QDir().mkpath(folder);
    path_ = QDir(folder).absolutePath().toStdString();
    if (QCoreApplication::instance() != nullptr)
        copyExamples(QString::fromStdString(programPath()), folder);
    fillFromDefaults(folder);
}

std::string companionFolder() {
    // The build says where the companions are installed, seen from the program.
    const QDir program(QCoreApplication::applicationDirPath());
    const QDir companions(program.absoluteFilePath(ZEL_COMPANIONS));
    return (companions.exists() ? QDir::cleanPath(companions.path()) : program.path())
        .toStdString();
}

QtSettingsStore::QtSettingsStore(ApplicationFolder& folder, FileService& files)
    : files_(files), file_(folder.path() + "/user.ini") {}

std::string QtSettingsStore::get(const std::string& application, const std::string& section,
                                 const std::string& key, const std::string& fallback) {
    return IniFile::load(files_, file_)
        .value(application, settingsKey(section, key))
        .value_or(fallback);
}

bool QtSettingsStore::set(const std::string& application, const std::string& section,
                          const std::string& key, const std::string& value) {
    IniFile settings = IniFile::load(files_, file_);
    const std::string name = settingsKey(section, key);
    // Each writing waits for the disk.
    if (settings.value(application, name) == value) return true;
    return settings.setValue(application, name, value) && settings.save(files_, file_);
}

void QtDebugChannel::output(const std::string& text) {
    if (linkLog().isDebugEnabled())
        qCDebug(linkLog).noquote() << QString::fromStdString(text).trimmed();
}

bool QtLauncher::start(const std::string& path, const std::vector<std::string>& arguments) {
    QStringList list;
    for (const std::string& argument : arguments) list << QString::fromStdString(argument);
    return QProcess::startDetached(QString::fromStdString(path), list);
}

bool QtStartupFolder::createLink(const std::string& linkName, const std::string& argument) {
    const QString entry = autostartEntry(linkName);
    QDir().mkpath(QFileInfo(entry).absolutePath());
    QSaveFile file(entry);
    if (!file.open(QIODevice::WriteOnly)) return false;
    const QString text =
        QString("[Desktop Entry]\nType=Application\nName=ZELRemote\nExec=\"%1\" %2\n")
            .arg(entryText(windowProgram()), QString::fromStdString(argument));
    file.write(text.toUtf8());
    return file.commit();
}

bool QtStartupFolder::removeLink(const std::string& linkName) {
    return QFile::remove(autostartEntry(linkName));
}

}  // namespace zel
