#include "desktop/windows/PowerPage.h"

#include <QGridLayout>
#include <cstddef>
#include <optional>
#include <string>

#include "analysis/HostMarkers.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"

namespace zel {
namespace {

constexpr double kMostDecibels = 1000;
constexpr double kWhole = 100;

QLineEdit* field(const char* name, const char* hint) {
    auto* box = new QLineEdit;
    box->setObjectName(name);
    box->setAccessibleName(QObject::tr(name));
    box->setPlaceholderText(QObject::tr(hint));
    return box;
}

QLabel* finding(const QString& name) {
    auto* label = new QLabel;
    label->setObjectName(name + " result");
    label->setWordWrap(true);
    label->setTextInteractionFlags(Qt::TextSelectableByMouse);
    return label;
}

bool isWrong(const QLineEdit& box) {
    return !box.text().trimmed().isEmpty() && !quantityOf(box.text());
}

}  // namespace

PowerPage::PowerPage(TraceTools& tools) : TracePage(tools) {
    auto* grid = new QGridLayout(this);
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    const auto row = [this, grid](const char* name, const char* unit, QLineEdit*& one,
                                  const char* hint, QLineEdit** two, const char* twoName,
                                  const char* twoHint, QLabel*& found) {
        const int at = grid->rowCount();
        one = field(name, hint);
        auto* caption = new QLabel(QObject::tr(name) + unit);
        caption->setBuddy(one);
        grid->addWidget(caption, at, 0);
        grid->addWidget(one, at, 1);
        connect(one, &QLineEdit::editingFinished, this, [this] { takeSettings(); });
        if (two != nullptr) {
            *two = field(twoName, twoHint);
            grid->addWidget(*two, at, 2);
            connect(*two, &QLineEdit::editingFinished, this, [this] { takeSettings(); });
        }
        found = finding(name);
        grid->addWidget(found, at + 1, 1, 1, 2);
    };
    row(QT_TRANSLATE_NOOP("QObject", "Bandwidth"), ", dB", down_,
        QT_TRANSLATE_NOOP("QObject", "dB down, as 3"), nullptr, "", "", bandwidth_);
    row(QT_TRANSLATE_NOOP("QObject", "Channel"), "", start_,
        QT_TRANSLATE_NOOP("QObject", "start, as 935M"), &stop_,
        QT_TRANSLATE_NOOP("QObject", "Channel stop"), QT_TRANSLATE_NOOP("QObject", "stop, as 960M"),
        channel_);
    row(QT_TRANSLATE_NOOP("QObject", "Occupied"), ", %", percent_,
        QT_TRANSLATE_NOOP("QObject", "percent, as 99"), nullptr, "", "", occupied_);
    row(QT_TRANSLATE_NOOP("QObject", "Adjacent"), "", width_,
        QT_TRANSLATE_NOOP("QObject", "width, as 5M"), &spacing_,
        QT_TRANSLATE_NOOP("QObject", "Channel spacing"),
        QT_TRANSLATE_NOOP("QObject", "spacing, as 5M"), adjacent_);
    auto* note = new QLabel(
        QObject::tr("The bandwidth stands about the strongest peak, the adjacent channels about "
                    "its frequency."));
    note->setWordWrap(true);
    grid->addWidget(note, grid->rowCount(), 0, 1, 3);
    word_ = new QLabel;
    grid->addWidget(word_, grid->rowCount(), 0, 1, 3);
    grid->setRowStretch(grid->rowCount(), 1);
    showState();
}

void PowerPage::takeSettings() {
    AnalysisRequest& request = tools_.request;
    const auto within = [](const QLineEdit& box, double highest) {
        const auto value = quantityOf(box.text());
        return value && *value > 0 && *value <= highest ? value : std::nullopt;
    };
    request.bandwidth = within(*down_, kMostDecibels);
    request.occupied = within(*percent_, kWhole);
    request.channels.clear();
    const auto start = quantityOf(start_->text());
    const auto stop = quantityOf(stop_->text());
    if (start && stop && *stop >= *start) request.channels = {{*start, *stop}};
    tools_.adjacent.reset();
    const auto width = quantityOf(width_->text());
    const auto spacing = quantityOf(spacing_->text());
    if (width && spacing && *width > 0 && *spacing > 0)
        tools_.adjacent = TraceTools::Adjacent{{}, *width, *spacing, 2};
    QString word;
    for (const QLineEdit* box : {down_, start_, stop_, percent_, width_, spacing_})
        if (isWrong(*box))
            word = QObject::tr("%1 is no number: %2").arg(box->accessibleName(), box->text());
    if (word.isEmpty() && start && stop && *stop < *start)
        word = QObject::tr("The channel's stop lies below its start");
    if (word.isEmpty() && !down_->text().trimmed().isEmpty() && !request.bandwidth)
        word = QObject::tr("The bandwidth takes dB above 0");
    if (word.isEmpty() && !percent_->text().trimmed().isEmpty() && !request.occupied)
        word = QObject::tr("The occupied bandwidth takes percent above 0, 100 at most");
    word_->setText(word);
    tools_.refresh();
}

void PowerPage::showState() {
    const AnalysisResult& result = tools_.result();
    const AnalysisRequest& request = tools_.request;
    const auto& trace = tools_.trace();
    const auto stretch = [&trace](std::optional<double> width, std::optional<double> low,
                                  std::optional<double> high) {
        return QObject::tr("%1, %2 to %3")
            .arg(placeText(width, trace), placeText(low, trace), placeText(high, trace));
    };
    const bool there = trace.has_value();
    const PeakWidth& width = result.width;
    bandwidth_->setText(
        !request.bandwidth || !there ? QString() : stretch(width.width(), width.low, width.high));
    channel_->setText(result.channels.empty() ? QString()
                                              : levelText(result.channels[0].power, result.unit));
    const auto& occupied = result.occupied;
    occupied_->setText(occupied ? stretch(occupied->width(), occupied->low, occupied->high)
                                : QString());
    QString beside;
    const AdjacentChannels& found = tools_.adjacentFound();
    if (tools_.adjacent && there) {
        beside = QObject::tr("Channel %1").arg(levelText(found.power, result.unit));
        for (std::size_t i = 0; i < found.sides.size(); ++i)
            beside += "\n" + QObject::tr("%1: lower %2, upper %3")
                                 .arg(i + 1)
                                 .arg(levelText(found.sides[i].lower, "dB"),
                                      levelText(found.sides[i].upper, "dB"));
    }
    adjacent_->setText(beside);
}

}  // namespace zel
