#include "desktop/windows/TracePage.h"

#include <QFile>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QSaveFile>
#include <cmath>
#include <optional>
#include <string>
#include <utility>

#include "desktop/graph/AxisText.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr double kShareOfStep = 0.1;
constexpr double kShareOfOne = 1e-6;  // where there is one sample alone
constexpr int kLevelDecimals = 2;
constexpr qint64 kLargestTable = 10'000'000;

QString none() { return QString::fromUtf8("–"); }

QString kindsOfTable() { return QObject::tr("Tables (*.csv *.txt);;All Files (*)"); }

}  // namespace

QString placeText(std::optional<double> x, const std::optional<SpectrumTrace>& trace) {
    if (!x || !trace) return none();
    const double step = trace->step();
    const double resolution = step > 0 ? step * kShareOfStep : std::fabs(*x) * kShareOfOne;
    return QString::fromStdString(axisText(*x, resolution, trace->xUnit));
}

QString levelText(std::optional<double> level, const std::string& unit) {
    return level ? QString::fromStdString(levelText(*level, unit, kLevelDecimals)) : none();
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
    const QString path = QFileDialog::getOpenFileName(&over, title, {}, kindsOfTable());
    if (path.isEmpty()) return std::nullopt;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || file.size() > kLargestTable) {
        QMessageBox::warning(
            &over, title,
            QObject::tr("The file %1 cannot be read: %2")
                .arg(path, file.isOpen() ? QObject::tr("it is too long") : file.errorString()));
        return std::nullopt;
    }
    if (name != nullptr) *name = QFileInfo(path).completeBaseName();
    return QString::fromUtf8(file.readAll());
}

void saveTable(QWidget& over, const QString& title, const QString& text) {
    const QString path = QFileDialog::getSaveFileName(&over, title, {}, kindsOfTable());
    if (path.isEmpty()) return;
    QSaveFile file(path);
    if (file.open(QIODevice::WriteOnly) && file.write(text.toUtf8()) >= 0 && file.commit()) return;
    QMessageBox::warning(
        &over, title,
        QObject::tr("The file %1 cannot be written: %2").arg(path, file.errorString()));
}

}  // namespace zel
