#include "desktop/windows/PeaksPage.h"

#include <QApplication>
#include <QClipboard>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QVBoxLayout>
#include <algorithm>
#include <cstddef>
#include <functional>
#include <limits>
#include <utility>
#include <vector>

#include "analysis/HostMarkers.h"
#include "analysis/Peaks.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kMostPeaks = 50;
constexpr int kPlaceColumn = 3;
constexpr int kFollowed = 10;  // peaks that a marker may follow
constexpr int kFixed = kFollowed + 1;
constexpr double kMostDecibels = 1000;

QTableWidget* makeTable(const QStringList& names, const QString& name) {
    auto* table = new QTableWidget(0, static_cast<int>(names.size()));
    table->setObjectName(name);
    table->setHorizontalHeaderLabels(names);
    table->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    table->verticalHeader()->setVisible(false);
    table->verticalHeader()->setDefaultSectionSize(24);
    table->setEditTriggers(QAbstractItemView::NoEditTriggers);
    table->setSelectionBehavior(QAbstractItemView::SelectRows);
    return table;
}

void put(QTableWidget& table, int row, int column, const QString& text) {
    QTableWidgetItem* item = table.item(row, column);
    if (item == nullptr) {
        table.setItem(row, column, item = new QTableWidgetItem);
        if (column != kPlaceColumn) item->setFlags(item->flags() & ~Qt::ItemIsEditable);
    }
    if (item->text() != text) item->setText(text);
}

QLineEdit* field(const char* name, const QString& hint, const QString& text) {
    auto* box = new QLineEdit(text);
    box->setObjectName(name);
    box->setAccessibleName(QObject::tr(name));
    box->setPlaceholderText(hint);
    box->setMaximumWidth(64);
    return box;
}

}  // namespace

PeaksPage::PeaksPage(TraceTools& tools, std::function<void(std::size_t)> goTo) : TracePage(tools) {
    auto* layout = new QVBoxLayout(this);
    auto* settings = new QHBoxLayout;
    count_ = field(QT_TRANSLATE_NOOP("QObject", "Peaks"), "", "10");
    threshold_ = field(QT_TRANSLATE_NOOP("QObject", "Threshold"), QObject::tr("none"), "");
    excursion_ = field(QT_TRANSLATE_NOOP("QObject", "Excursion"), "6", "6");
    for (const auto& [text, box] :
         {std::pair(QObject::tr("Peaks"), count_), std::pair(QObject::tr("Over"), threshold_),
          std::pair(QObject::tr("Fall, dB"), excursion_)}) {
        auto* label = new QLabel(text);
        label->setBuddy(box);
        settings->addWidget(label);
        settings->addWidget(box);
        connect(box, &QLineEdit::editingFinished, this, [this] { takeSettings(); });
    }
    order_ = new QComboBox;
    order_->setAccessibleName(QObject::tr("Order"));
    order_->addItems({QObject::tr("By level"), QObject::tr("By x")});
    connect(order_, &QComboBox::currentIndexChanged, this, [this] { showState(); });
    settings->addWidget(order_);
    layout->addLayout(settings);
    table_ = makeTable({QObject::tr("Peak"), "x", QObject::tr("Level")}, "PeaksTable");
    table_->setAccessibleName(QObject::tr("Peaks"));
    connect(table_, &QTableWidget::cellClicked, this, [this, goTo = std::move(goTo)](int row) {
        goTo(static_cast<std::size_t>(table_->item(row, 0)->text().toInt()));
    });
    table_->setToolTip(QObject::tr("A click puts a marker on the peak"));
    layout->addWidget(table_, 1);
    auto* keys = new QHBoxLayout;
    copy_ = new QPushButton(QObject::tr("Copy Table"));
    connect(copy_, &QPushButton::clicked, this,
            [this] { QApplication::clipboard()->setText(asText()); });
    save_ = new QPushButton(QObject::tr("Save Table..."));
    connect(save_, &QPushButton::clicked, this, [this] {
        QString text = "peak;x;level\r\n";
        int number = 0;
        for (const Peak& peak : tools_.result().peaks)
            text +=
                QString::number(++number) + ";" +
                QString::fromStdString(shortestNumber(peak.x) + ";" + shortestNumber(peak.level)) +
                "\r\n";
        saveTable(*this, QObject::tr("Save Peaks"), text);
    });
    keys->addWidget(copy_);
    keys->addWidget(save_);
    keys->addStretch();
    layout->addLayout(keys);
    showState();
}

void PeaksPage::takeSettings() {
    AnalysisRequest& request = tools_.request;
    if (const auto count = wholeNumber(count_->text().trimmed().toStdString(), 1, kMostPeaks))
        request.peaks = static_cast<std::size_t>(*count);
    const auto level = parseNumber(threshold_->text().toStdString());
    request.search.threshold = level.value_or(std::numeric_limits<double>::lowest());
    const auto fall = parseNumber(excursion_->text().toStdString());
    if (fall && *fall >= 0 && *fall <= kMostDecibels) request.search.excursion = *fall;
    // What was no number goes back to what holds.
    count_->setText(QString::number(request.peaks));
    if (!level) threshold_->clear();
    excursion_->setText(QString::fromStdString(generalNumber(request.search.excursion)));
    tools_.refresh();
}

void PeaksPage::showState() {
    const AnalysisResult& result = tools_.result();
    std::vector<std::size_t> order;
    for (std::size_t i = 0; i < result.peaks.size(); ++i) order.push_back(i);
    if (order_->currentIndex() == 1)
        std::sort(order.begin(), order.end(), [&result](std::size_t one, std::size_t other) {
            return result.peaks[one].x < result.peaks[other].x;
        });
    copy_->setEnabled(!order.empty());
    save_->setEnabled(!order.empty());
    table_->setRowCount(static_cast<int>(order.size()));
    for (std::size_t row = 0; row < order.size(); ++row) {
        const Peak& peak = result.peaks[order[row]];
        const int at = static_cast<int>(row);
        put(*table_, at, 0, QString::number(order[row] + 1));
        put(*table_, at, 1, placeText(peak.x, tools_.trace()));
        put(*table_, at, 2, levelText(peak.level, result.unit));
    }
}

QString PeaksPage::asText() const {
    QString text = QObject::tr("Peak") + "\tx\t" + QObject::tr("Level") + "\n";
    for (int row = 0; row < table_->rowCount(); ++row)
        text += table_->item(row, 0)->text() + "\t" + table_->item(row, 1)->text() + "\t" +
                table_->item(row, 2)->text() + "\n";
    return text;
}

MarkersPage::MarkersPage(TraceTools& tools) : TracePage(tools) {
    auto* layout = new QVBoxLayout(this);
    table_ = makeTable({"", QObject::tr("At"), QObject::tr("Delta to"), "x", QObject::tr("Level"),
                        QObject::tr("Noise")},
                       "MarkersTable");
    table_->setAccessibleName(QObject::tr("Markers"));
    table_->setRowCount(static_cast<int>(kHostMarkers));
    for (const int narrow : {0, 1, 2, 4, 5})  // the place has the most digits
        table_->horizontalHeader()->setSectionResizeMode(narrow, QHeaderView::ResizeToContents);
    QStringList places = {QObject::tr("Off")};
    for (int i = 1; i <= kFollowed; ++i) places << QObject::tr("Peak %1").arg(i);
    places << QObject::tr("Here");
    QStringList markers = {QString::fromUtf8("–")};
    for (std::size_t i = 1; i <= kHostMarkers; ++i) markers << "M" + QString::number(i);
    for (std::size_t i = 0; i < kHostMarkers; ++i) {
        const int row = static_cast<int>(i);
        const QString name = "M" + QString::number(i + 1);
        put(*table_, row, 0, name);
        follows_.at(i) = new QComboBox;
        follows_.at(i)->addItems(places);
        follows_.at(i)->setAccessibleName(QObject::tr("Place of %1").arg(name));
        follows_.at(i)->setToolTip(QObject::tr("Here: stays where it is, while the sweeps go on"));
        delta_.at(i) = new QComboBox;
        delta_.at(i)->addItems(markers);
        delta_.at(i)->setAccessibleName(QObject::tr("Reference of %1").arg(name));
        table_->setCellWidget(row, 1, follows_.at(i));
        table_->setCellWidget(row, 2, delta_.at(i));
        for (QComboBox* box : {follows_.at(i), delta_.at(i)})
            connect(box, &QComboBox::activated, this, [this] { takeSettings(); });
    }
    table_->setEditTriggers(QAbstractItemView::DoubleClicked | QAbstractItemView::EditKeyPressed |
                            QAbstractItemView::AnyKeyPressed);
    table_->setToolTip(
        QObject::tr("A place can be typed into the column x; the mouse drags a marker"));
    connect(table_, &QTableWidget::itemChanged, this, [this](QTableWidgetItem* item) {
        if (item->column() == kPlaceColumn) takePlace(item->row(), item->text());
    });
    layout->addWidget(table_);
    word_ = new QLabel;
    word_->setObjectName("MarkersWord");
    word_->setWordWrap(true);
    layout->addWidget(word_);
    showState();
}

void MarkersPage::takePlace(int row, const QString& text) {
    const auto& trace = tools_.trace();
    const auto x = quantityOf(text);
    word_->clear();
    if (!x) {
        word_->setText(QObject::tr("This is no place: %1; 935.2M is one").arg(text));
    } else if (trace && !trace->x.empty() && (*x < trace->x.front() || *x > trace->x.back())) {
        word_->setText(QObject::tr("The sweep does not reach %1").arg(placeText(x, trace)));
    } else {
        HostMarker& marker = tools_.markers.at(static_cast<std::size_t>(row));
        marker.on = true;
        marker.peak = 0;
        marker.x = *x;
    }
    tools_.refresh();
    showState();
}

void MarkersPage::takeSettings() {
    for (std::size_t i = 0; i < kHostMarkers; ++i) {
        HostMarker& marker = tools_.markers.at(i);
        const int place = follows_.at(i)->currentIndex();
        if (place == kFixed && (marker.peak > 0 || !marker.on)) {
            // It stays where it was last seen, a new one in the middle.
            const auto& trace = tools_.trace();
            if (const auto last = tools_.readings().at(i).x) {
                marker.x = *last;
            } else if (trace && !trace->x.empty()) {
                marker.x = trace->x[trace->x.size() / 2];
            }
        }
        marker.on = place > 0;
        marker.peak = place > 0 && place < kFixed ? static_cast<std::size_t>(place) : 0;
        marker.reference = static_cast<std::size_t>(delta_.at(i)->currentIndex());
    }
    tools_.refresh();
}

void MarkersPage::follow(std::size_t peak) {
    const auto free = std::find_if(tools_.markers.begin(), tools_.markers.end(),
                                   [](const HostMarker& marker) { return !marker.on; });
    HostMarker& marker = free == tools_.markers.end() ? tools_.markers.front() : *free;
    const auto there =
        std::find_if(tools_.markers.begin(), tools_.markers.end(),
                     [peak](const HostMarker& other) { return other.on && other.peak == peak; });
    if (there == tools_.markers.end()) {
        marker.on = true;
        marker.peak = peak;
    }
    tools_.refresh();
}

void MarkersPage::showState() {
    const QSignalBlocker quiet(table_);  // what is written here was not typed
    const AnalysisResult& result = tools_.result();
    for (std::size_t i = 0; i < kHostMarkers; ++i) {
        const HostMarker& marker = tools_.markers.at(i);
        const MarkerReading& reading = tools_.readings().at(i);
        const int row = static_cast<int>(i);
        follows_.at(i)->setCurrentIndex(!marker.on        ? 0
                                        : marker.peak > 0 ? static_cast<int>(marker.peak)
                                                          : kFixed);
        delta_.at(i)->setCurrentIndex(static_cast<int>(marker.reference));
        const bool delta = reading.deltaX.has_value();
        const QString sign = delta ? QString::fromUtf8("Δ ") : QString();
        const auto shown = [&marker](const QString& text) { return marker.on ? text : QString(); };
        put(*table_, row, 3,
            shown(sign + placeText(delta ? reading.deltaX : reading.x, tools_.trace())));
        put(*table_, row, 4,
            shown(sign + (delta ? levelText(reading.deltaLevel, "dB")
                                : levelText(reading.level, result.unit))));
        put(*table_, row, 5, shown(levelText(reading.density, result.unit + "/Hz")));
    }
}

}  // namespace zel
