#include "desktop/windows/TracesPage.h"

#include <QColorDialog>
#include <QFile>
#include <QFileDialog>
#include <QPainter>
#include <cstddef>
#include <functional>
#include <optional>
#include <stdexcept>
#include <utility>

#include "analysis/Hold.h"
#include "analysis/HostTraces.h"
#include "analysis/SavedTraces.h"
#include "analysis/SpectrumTrace.h"
#include "analysis/TraceTools.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/graph/TraceOverlay.h"
#include "desktop/windows/TracePage.h"

namespace zel {
namespace {

constexpr QSize kSwatch(20, 20);
constexpr int kSwatchLine = 4;
constexpr int kEdgeOfBox = 1;
constexpr qint64 kLargestView = 100'000'000;

/// `about` is read with the text.
QPushButton* button(const QString& text, const QString& name, const QString& about = {}) {
    auto* key = new QPushButton(text);
    key->setAccessibleName(about.isEmpty() ? text : text + ", " + about);
    key->setObjectName(name);
    return key;
}

}  // namespace

TracesPage::TracesPage(TraceTools& tools, std::function<void()> scale) : TracePage(tools) {
    auto* grid = new QGridLayout(this);
    grid->setColumnStretch(1, 1);
    for (std::size_t i = 0; i < kHolds; ++i) {
        const auto kind = static_cast<HoldKind>(i);
        const QString name = kNames.at(i);
        const int row = static_cast<int>(i);
        HoldRow& line = holds_.at(i);
        line = {new QCheckBox(QObject::tr(kNames.at(i))), new QLabel,
                button(QObject::tr("Clear"), "Clear " + name, QObject::tr(kNames.at(i)))};
        line.on->setObjectName(name);
        connect(line.on, &QCheckBox::toggled, this, [this, kind](bool on) {
            tools_.traces().switchOn(kind, on);
            tools_.refresh();
        });
        connect(line.clear, &QPushButton::clicked, this, [this, kind] {
            tools_.traces().clear(kind);
            tools_.refresh();
        });
        grid->addWidget(swatch(i, name, QObject::tr(kNames.at(i))), row, 0);
        grid->addWidget(line.on, row, 1);
        grid->addWidget(line.count, row, 2, 1, 3);
        grid->addWidget(line.clear, row, 5);
    }
    for (std::size_t i = 0; i < kMemories; ++i) buildMemory(*grid, static_cast<int>(kHolds + i), i);
    auto* fit = button(QObject::tr("Scale Level Axis"), "Scale Level Axis");
    fit->setToolTip(
        QObject::tr("Fits the level axis to what is on the graph, until the next setting"));
    connect(fit, &QPushButton::clicked, this, std::move(scale));
    const int last = static_cast<int>(kHolds + kMemories);
    grid->addWidget(swatch(kColors - 1, "Corrected sweep", QObject::tr("Corrected sweep")), last,
                    0);
    // In line with the words of the boxes over it.
    auto* corrected = new QLabel(QObject::tr("Corrected sweep"));
    corrected->setObjectName("CorrectedLabel");
    corrected->setIndent(style()->pixelMetric(QStyle::PM_IndicatorWidth) +
                         style()->pixelMetric(QStyle::PM_CheckBoxLabelSpacing) + kEdgeOfBox);
    grid->addWidget(corrected, last, 1);
    grid->addWidget(fit, last, 2, 1, 4);
    word_ = new QLabel;
    word_->setWordWrap(true);
    grid->addWidget(word_, last + 1, 0, 1, 6);
    grid->setRowStretch(last + 2, 1);
    showState();
}

void TracesPage::buildMemory(QGridLayout& grid, int row, std::size_t place) {
    const QString name = "Reference " + QString::number(place + 1);
    const QString shown = QObject::tr("Reference %1").arg(place + 1);
    MemoryRow& line = memories_.at(place);
    line = {button(QObject::tr("Store"), "Store " + name, shown),
            button(QObject::tr("Load..."), "Load " + name, shown), new QCheckBox(shown),
            new QCheckBox(QObject::tr("Subtract")),
            button(QObject::tr("Clear"), "Clear " + name, shown)};
    line.show->setObjectName(name);
    line.less->setObjectName("Subtract " + name);
    line.less->setToolTip(QObject::tr("Shows the sweep less this reference, in dB"));
    line.load->setToolTip(QObject::tr("Takes the first trace of a saved view or a recording"));
    grid.addWidget(swatch(kHolds + place, name, shown), row, 0);
    grid.addWidget(line.show, row, 1);
    grid.addWidget(line.store, row, 2);
    grid.addWidget(line.load, row, 3);
    grid.addWidget(line.less, row, 4);
    grid.addWidget(line.clear, row, 5);
    connect(line.load, &QPushButton::clicked, this, [this, place] {
        const QString path = QFileDialog::getOpenFileName(this, QObject::tr("Load Reference"), {},
                                                          "Views (*.csv *.txt);;All Files (*)");
        if (!path.isEmpty()) loadMemory(place, path);
    });
    connect(line.store, &QPushButton::clicked, this, [this, place] {
        if (!tools_.trace()) return;
        tools_.traces().remember(place, *tools_.trace());
        memories_.at(place).show->setChecked(true);
        tools_.refresh();
    });
    connect(line.clear, &QPushButton::clicked, this, [this, place] {
        tools_.traces().forget(place);
        tools_.refresh();
    });
    connect(line.show, &QCheckBox::toggled, this, [this] { tools_.refresh(); });
    connect(line.less, &QCheckBox::toggled, this, [this, place](bool on) {
        for (std::size_t i = 0; on && i < kMemories; ++i)
            if (i != place) memories_.at(i).less->setChecked(false);
        tools_.refresh();
    });
}

void TracesPage::paint(std::size_t place, const QColor& color) {
    colors_.at(place) = color;
    QPixmap picture(kSwatch);
    picture.fill(Qt::transparent);
    QPainter(&picture).fillRect(0, (kSwatch.height() - kSwatchLine) / 2, kSwatch.width(),
                                kSwatchLine, color);
    swatches_.at(place)->setIcon(picture);
}

QToolButton* TracesPage::swatch(std::size_t place, const QString& name, const QString& shown) {
    auto* key = new QToolButton;
    key->setAutoRaise(true);
    key->setIconSize(kSwatch);
    key->setObjectName("Colour of " + name);
    key->setAccessibleName(QObject::tr("Colour of %1").arg(shown));
    key->setToolTip(QObject::tr("Chooses the colour"));
    swatches_.at(place) = key;
    paint(place, hostTraceColor(place));
    connect(key, &QToolButton::clicked, this, [this, place, shown] {
        const QColor color =
            QColorDialog::getColor(colors_.at(place), this, QObject::tr("Colour of %1").arg(shown));
        if (!color.isValid()) return;
        paint(place, color);
        tools_.refresh();
    });
    return key;
}

void TracesPage::loadMemory(std::size_t place, const QString& path) {
    fileWord_.clear();
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || file.size() > kLargestView) {
        fileWord_ =
            QObject::tr("The reference was not taken: %1")
                .arg(file.isOpen() ? QObject::tr("the file is too long") : file.errorString());
        return showState();
    }
    try {
        std::optional<SpectrumTrace> first;
        readTraces(file.readAll().toStdString(), DateOrder::YearMonthDay,
                   [&first](const SpectrumTrace& trace) {
                       first = trace;
                       return false;
                   });
        if (first) tools_.traces().remember(place, *first);
        memories_.at(place).show->setChecked(true);
    } catch (const std::runtime_error& wrong) {
        fileWord_ =
            QObject::tr("The reference was not taken: %1").arg(QString::fromUtf8(wrong.what()));
    }
    tools_.refresh();
    showState();
}

std::optional<std::size_t> TracesPage::normalisedBy() const {
    for (std::size_t i = 0; i < kMemories; ++i)
        if (memories_.at(i).less->isChecked()) return i;
    return std::nullopt;
}

void TracesPage::showState() {
    for (std::size_t i = 0; i < kHolds; ++i) {
        const auto kind = static_cast<HoldKind>(i);
        const auto count = static_cast<qulonglong>(tools_.traces().count(kind));
        const QSignalBlocker quiet(holds_.at(i).on);
        holds_.at(i).on->setChecked(tools_.traces().isOn(kind));
        holds_.at(i).count->setText(count == 0   ? QString()
                                    : count == 1 ? QObject::tr("1 sweep")
                                                 : QObject::tr("%1 sweeps").arg(count));
        holds_.at(i).clear->setEnabled(count > 0);
    }
    for (std::size_t i = 0; i < kMemories; ++i) {
        const bool there = tools_.traces().memory(i).has_value();
        memories_.at(i).store->setEnabled(tools_.trace().has_value());
        for (QWidget* key : {static_cast<QWidget*>(memories_.at(i).show),
                             static_cast<QWidget*>(memories_.at(i).less),
                             static_cast<QWidget*>(memories_.at(i).clear)})
            key->setEnabled(there);
    }
    const QString word = tools_.problem().empty()
                             ? ownText(tools_.traces().ended())
                             : QObject::tr("No figures: %1").arg(ownText(tools_.problem()));
    word_->setText(fileWord_.isEmpty() ? word : fileWord_);
}

}  // namespace zel
