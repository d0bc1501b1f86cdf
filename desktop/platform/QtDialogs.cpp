#include "desktop/platform/QtDialogs.h"

#include <QApplication>
#include <QClipboard>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QGuiApplication>
#include <QInputDialog>
#include <QMainWindow>
#include <QMessageBox>
#include <QStandardPaths>
#include <optional>
#include <string>

#include "platform/MessageBox.h"
#include "platform/Services.h"

namespace zel {
namespace {

QMessageBox::Icon iconOf(BoxIcon icon) {
    switch (icon) {
        case BoxIcon::Plain:
            return QMessageBox::NoIcon;
        case BoxIcon::Critical:
            return QMessageBox::Critical;
        case BoxIcon::Question:
            return QMessageBox::Question;
        case BoxIcon::Warning:
        case BoxIcon::Exclamation:
            return QMessageBox::Warning;
        case BoxIcon::Information:
            return QMessageBox::Information;
    }
    return QMessageBox::NoIcon;
}

struct ButtonSet {
    BoxButtons set = BoxButtons::Ok;
    QMessageBox::StandardButtons buttons;
    QMessageBox::StandardButton escape = QMessageBox::Ok;
};
const ButtonSet kButtonSets[] = {
    {BoxButtons::Ok, QMessageBox::Ok, QMessageBox::Ok},
    {BoxButtons::OkCancel, QMessageBox::Ok | QMessageBox::Cancel, QMessageBox::Cancel},
    {BoxButtons::YesNo, QMessageBox::Yes | QMessageBox::No, QMessageBox::No},
    {BoxButtons::YesNoCancel, QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel,
     QMessageBox::Cancel},
};

/// The window that a box belongs to. Between two boxes none may be the active one yet.
QWidget* windowInFront() {
    if (QWidget* active = QApplication::activeWindow()) return active;
    if (QWidget* modal = QApplication::activeModalWidget()) return modal;
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window->isVisible() && qobject_cast<QMainWindow*>(window) != nullptr) return window;
    return nullptr;
}

QString linesOf(const std::string& text) {
    return QString::fromStdString(text).replace("\r\n", "\n");
}

BoxAnswer answerOf(int button) {
    switch (button) {
        case QMessageBox::Cancel:
            return BoxAnswer::Cancel;
        case QMessageBox::Yes:
            return BoxAnswer::Yes;
        case QMessageBox::No:
            return BoxAnswer::No;
        default:
            return BoxAnswer::Ok;
    }
}

/// "Text (*.txt)|*.txt|All (*.*)|*.*" as Qt writes filters.
QStringList filtersOf(const std::string& filter) {
    QStringList result;
    const QStringList pieces = QString::fromStdString(filter).split('|');
    for (int i = 0; i + 1 < pieces.size(); i += 2) {
        QString name = pieces[i];
        const auto bracket = name.lastIndexOf('(');
        if (bracket >= 0) name.truncate(bracket);
        // The request calls a metafile a text.
        if (pieces[i + 1] == "*.wmf") name = "WMF Files";
        const QString pattern = pieces[i + 1] == "*.*" ? QString("*") : pieces[i + 1];
        result << name.trimmed() + " (" + pattern + ")";
    }
    return result;
}

constexpr const char* kApplication = "ZELRemote";
constexpr const char* kSection = "Desktop";
constexpr const char* kFolderKey = "Folder";

/// A folder or one below it.
bool isWithin(const QString& folder, const QString& outer) {
    const QString inner = QFileInfo(folder).canonicalFilePath();
    const QString whole = QFileInfo(outer).canonicalFilePath();
    return !inner.isEmpty() && (inner == whole || inner.startsWith(whole + '/'));
}

/// In a folder that file managers hide nobody would find the file again, nor among the program's
/// own files.
QString startFolder(const QString& last, const QString& asked, const QString& own) {
    if (!last.isEmpty() && QFileInfo(last).isDir()) return last;
    const bool apart = asked.isEmpty() || asked.contains("/.") || !QFileInfo(asked).isDir() ||
                       isWithin(asked, own);
    if (!apart) return asked;
    const QString documents = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
    return QFileInfo(documents).isDir() ? documents : QDir::homePath();
}

/// "txt" of "Text Files (*.txt)"; empty for one of all files.
QString endingOf(const QString& filter) {
    const auto at = filter.lastIndexOf("*.");
    return at < 0 ? QString() : filter.mid(at + 2).section(')', 0, 0).section(' ', 0, 0);
}

}  // namespace

std::optional<std::string> QtFileDialogs::chosen(const FileDialogRequest& request, bool save) {
    const std::string last = settings_.get(kApplication, kSection, kFolderKey, "");
    QFileDialog dialog(
        windowInFront(), QString::fromStdString(request.title),
        startFolder(QString::fromStdString(last), QString::fromStdString(request.folder),
                    QString::fromStdString(own_.path())));
    dialog.setAcceptMode(save ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    dialog.setFileMode(save ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    dialog.setOption(QFileDialog::DontConfirmOverwrite, !request.promptOverwrite);
    const QStringList filters = filtersOf(request.filter);
    if (!filters.isEmpty()) {
        dialog.setNameFilters(filters);
        const int index = request.filterIndex - 1;
        if (index >= 0 && index < filters.size()) dialog.selectNameFilter(filters[index]);
    }
    if (save) {
        dialog.setDefaultSuffix(endingOf(dialog.selectedNameFilter()));
        QObject::connect(
            &dialog, &QFileDialog::filterSelected, &dialog,
            [&dialog](const QString& filter) { dialog.setDefaultSuffix(endingOf(filter)); });
    }
    if (!request.fileName.empty()) dialog.selectFile(QString::fromStdString(request.fileName));
    if (dialog.exec() != QDialog::Accepted || dialog.selectedFiles().isEmpty()) return std::nullopt;
    const QString file = dialog.selectedFiles().first();
    if (const std::string folder = QFileInfo(file).absolutePath().toStdString(); folder != last)
        settings_.set(kApplication, kSection, kFolderKey, folder);
    return file.toStdString();
}

namespace {

/// The wait cursor says that work goes on; a question is not work.
class NormalPointer {
  public:
    NormalPointer() : overridden_(QGuiApplication::overrideCursor() != nullptr) {
        if (overridden_) QGuiApplication::setOverrideCursor(Qt::ArrowCursor);
    }
    ~NormalPointer() {
        if (overridden_) QGuiApplication::restoreOverrideCursor();
    }
    NormalPointer(const NormalPointer&) = delete;
    NormalPointer& operator=(const NormalPointer&) = delete;

  private:
    bool overridden_;
};

}  // namespace

BoxAnswer QtMessageBoxes::show(const Box& box) {
    const NormalPointer pointer;
    QMessageBox window(windowInFront());
    window.setIcon(iconOf(box.icon));
    window.setWindowTitle(QString::fromStdString(box.title));
    window.setTextFormat(Qt::PlainText);
    window.setText(linesOf(box.text));
    for (const ButtonSet& row : kButtonSets) {
        if (row.set != box.buttons) continue;
        window.setStandardButtons(row.buttons);
        window.setEscapeButton(row.escape);
    }
    const bool question =
        box.buttons == BoxButtons::YesNo || box.buttons == BoxButtons::YesNoCancel;
    window.setDefaultButton(question ? QMessageBox::Yes : QMessageBox::Ok);
    return answerOf(window.exec());
}

std::optional<std::string> QtMessageBoxes::prompt(const std::string& text, const std::string& title,
                                                  const std::string& preset) {
    const NormalPointer pointer;
    bool accepted = false;
    const QString reply =
        QInputDialog::getText(windowInFront(), QString::fromStdString(title), linesOf(text),
                              QLineEdit::Normal, QString::fromStdString(preset), &accepted);
    if (!accepted) return std::nullopt;
    return reply.toStdString();
}

std::optional<std::string> QtFileDialogs::save(const FileDialogRequest& request) {
    return chosen(request, true);
}

std::optional<std::string> QtFileDialogs::open(const FileDialogRequest& request) {
    return chosen(request, false);
}

void QtClipboard::setText(const std::string& text) {
    QGuiApplication::clipboard()->setText(QString::fromStdString(text));
}

std::string QtClipboard::text() { return QGuiApplication::clipboard()->text().toStdString(); }

}  // namespace zel
