#include "desktop/windows/TracePage.h"

#include <QFile>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QSaveFile>
#include <optional>
#include <string>
#include <utility>

#include "model/Numeric.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kPlaceDecimals = 6;
constexpr int kLevelDecimals = 2;
constexpr qint64 kLargestTable = 10'000'000;
const char* const kTables = "Tables (*.csv *.txt);;All Files (*)";

}  // namespace

QString placeText(std::optional<double> x, const std::string& unit) {
    if (!x) return QString::fromUtf8("–");
    return QString::fromStdString(FormatValue(*x, unit, "", true, true, kPlaceDecimals));
}

QString levelText(std::optional<double> level, const std::string& unit) {
    if (!level) return QString::fromUtf8("–");
    const std::string number = generalNumber(roundHalfEven(*level, kLevelDecimals));
    return QString::fromStdString(number + (unit.empty() ? "" : " " + unit));
}

std::optional<double> quantityOf(const QString& text) {
    QString plain = text.trimmed();
    for (const char* unit : {"Hz", "hz", "HZ"})
        if (plain.endsWith(unit)) plain.chop(2);
    plain = plain.trimmed();
    double factor = 1;
    constexpr std::pair<char, double> kPrefixes[] = {
        {'k', 1e3}, {'K', 1e3}, {'M', 1e6}, {'G', 1e9}, {'m', 1e-3}};
    for (const auto& [prefix, value] : kPrefixes)
        if (plain.endsWith(QLatin1Char(prefix))) {
            factor = value;
            plain.chop(1);
            break;
        }
    const std::optional<double> number = parseNumber(plain.trimmed().toStdString());
    return number ? std::optional<double>(*number * factor) : std::nullopt;
}

std::optional<QString> readTable(QWidget& over, const QString& title, QString* name) {
    const QString path = QFileDialog::getOpenFileName(&over, title, {}, kTables);
    if (path.isEmpty()) return std::nullopt;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || file.size() > kLargestTable) {
        QMessageBox::warning(&over, title,
                             "The file " + path + " cannot be read: " +
                                 (file.isOpen() ? "it is too long" : file.errorString()));
        return std::nullopt;
    }
    if (name != nullptr) *name = QFileInfo(path).completeBaseName();
    return QString::fromUtf8(file.readAll());
}

void saveTable(QWidget& over, const QString& title, const QString& text) {
    const QString path = QFileDialog::getSaveFileName(&over, title, {}, kTables);
    if (path.isEmpty()) return;
    QSaveFile file(path);
    if (file.open(QIODevice::WriteOnly) && file.write(text.toUtf8()) >= 0 && file.commit()) return;
    QMessageBox::warning(&over, title,
                         "The file " + path + " cannot be written: " + file.errorString());
}

}  // namespace zel
