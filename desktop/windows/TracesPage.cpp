#include "desktop/windows/TracesPage.h"

#include "desktop/graph/TraceOverlay.h"

namespace zel {
namespace {

QLabel* swatch(std::size_t place) {
    auto* label = new QLabel;
    label->setFixedSize(18, 3);
    label->setStyleSheet("background: " + hostTraceColor(place).name());
    return label;
}

QPushButton* button(const QString& text, const QString& name) {
    auto* key = new QPushButton(text);
    key->setAccessibleName(name);
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
        line = {new QCheckBox(name), new QLabel, button("Clear", "Clear " + name)};
        line.on->setObjectName(name);
        connect(line.on, &QCheckBox::toggled, this, [this, kind](bool on) {
            tools_.traces().switchOn(kind, on);
            tools_.refresh();
        });
        connect(line.clear, &QPushButton::clicked, this, [this, kind] {
            tools_.traces().clear(kind);
            tools_.refresh();
        });
        grid->addWidget(swatch(i), row, 0);
        grid->addWidget(line.on, row, 1);
        grid->addWidget(line.count, row, 2, 1, 2);
        grid->addWidget(line.clear, row, 4);
    }
    for (std::size_t i = 0; i < kMemories; ++i) buildMemory(*grid, static_cast<int>(kHolds + i), i);
    auto* fit = button("Scale Level Axis", "Scale Level Axis");
    fit->setToolTip("Fits the level axis to what is on the graph, until the next setting");
    connect(fit, &QPushButton::clicked, this, std::move(scale));
    const int last = static_cast<int>(kHolds + kMemories);
    grid->addWidget(fit, last, 1);
    word_ = new QLabel;
    word_->setWordWrap(true);
    grid->addWidget(word_, last + 1, 0, 1, 5);
    grid->setRowStretch(last + 2, 1);
    showState();
}

void TracesPage::buildMemory(QGridLayout& grid, int row, std::size_t place) {
    const QString name = "Reference " + QString::number(place + 1);
    MemoryRow& line = memories_.at(place);
    line = {button("Store", "Store " + name), new QCheckBox(name), new QCheckBox("Subtract"),
            button("Clear", "Clear " + name)};
    line.show->setObjectName(name);
    line.less->setObjectName("Subtract " + name);
    line.less->setToolTip("Shows the sweep less this reference, in dB");
    grid.addWidget(swatch(kHolds + place), row, 0);
    grid.addWidget(line.show, row, 1);
    grid.addWidget(line.store, row, 2);
    grid.addWidget(line.less, row, 3);
    grid.addWidget(line.clear, row, 4);
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
        holds_.at(i).count->setText(
            count == 0 ? QString() : QString::number(count) + (count == 1 ? " sweep" : " sweeps"));
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
    word_->setText(QString::fromStdString(
        tools_.problem().empty() ? tools_.traces().ended() : "No figures: " + tools_.problem()));
}

}  // namespace zel
