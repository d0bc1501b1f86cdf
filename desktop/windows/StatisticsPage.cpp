#include "desktop/windows/StatisticsPage.h"

#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>
#include <cstddef>
#include <optional>
#include <vector>

#include "analysis/SpectrumTrace.h"
#include "analysis/TraceTools.h"
#include "desktop/graph/DivisionTicker.h"
#include "desktop/graph/GraphColors.h"
#include "desktop/graph/TraceOverlay.h"
#include "desktop/windows/TracePage.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr double kUsualThreshold = -80;
constexpr int kCurves = 4;

QVector<double> vectorOf(const std::vector<double>& values) {
    return {values.begin(), values.end()};
}

}  // namespace

StatisticsPage::StatisticsPage(TraceTools& tools) : TracePage(tools) {
    auto* layout = new QVBoxLayout(this);
    auto* row = new QHBoxLayout;
    on_ = new QCheckBox(QObject::tr("Count"));
    on_->setObjectName("CountStatistics");
    threshold_ = new QLineEdit(QString::fromStdString(generalNumber(kUsualThreshold)));
    threshold_->setAccessibleName(QObject::tr("Occupancy over"));
    threshold_->setMaximumWidth(64);
    auto* caption = new QLabel(QObject::tr("Occupied at or over"));
    caption->setBuddy(threshold_);
    count_ = new QLabel;
    save_ = new QPushButton(QObject::tr("Save Table..."));
    row->addWidget(on_);
    row->addWidget(caption);
    row->addWidget(threshold_);
    row->addWidget(count_, 1);
    row->addWidget(save_);
    layout->addLayout(row);
    plot_ = new QCustomPlot;
    plot_->setMinimumHeight(150);
    plot_->setAccessibleName(QObject::tr("Statistics"));
    const GraphColors colors = darkGraph();
    plot_->setBackground(colors.background);
    plot_->axisRect()->setBackground(colors.plotArea);
    plot_->setPlottingHints(QCP::phFastPolylines | QCP::phCacheLabels);
    for (QCPAxis* axis : {plot_->xAxis, plot_->yAxis, plot_->yAxis2}) {
        axis->setBasePen(QPen(colors.frame, 1));
        axis->setTickPen(QPen(colors.frame, 1));
        axis->setSubTicks(false);
        axis->setTickLabelColor(colors.text);
        axis->setLabelColor(colors.text);
        axis->grid()->setPen(QPen(colors.grid, 1));
    }
    plot_->xAxis->setTicker(QSharedPointer<DivisionTicker>(new DivisionTicker(2)));
    plot_->yAxis2->setVisible(true);
    plot_->yAxis2->setLabel(QObject::tr("occupied, %"));
    plot_->yAxis2->setRange(0, 100);
    for (int i = 0; i < kCurves; ++i) {
        const bool share = i + 1 == kCurves;
        QCPGraph* curve = plot_->addGraph(plot_->xAxis, share ? plot_->yAxis2 : plot_->yAxis);
        curve->setPen(share ? QPen(colors.text, 1, Qt::DotLine)
                            : QPen(hostTraceColor(static_cast<std::size_t>(i)), 1));
        curve->setAdaptiveSampling(false);
    }
    layout->addWidget(plot_, 1);
    connect(on_, &QCheckBox::toggled, this, [this] { takeSettings(); });
    connect(threshold_, &QLineEdit::editingFinished, this, [this] { takeSettings(); });
    connect(save_, &QPushButton::clicked, this, [this] {
        if (tools_.statistics())
            saveTable(*this, QObject::tr("Save Statistics"),
                      QString::fromStdString(tools_.statistics()->table()));
    });
    showState();
}

void StatisticsPage::takeSettings() {
    const auto level = parseNumber(threshold_->text().toStdString());
    if (!level) threshold_->setText(QString::fromStdString(generalNumber(kUsualThreshold)));
    tools_.countStatistics(on_->isChecked() ? std::optional(level.value_or(kUsualThreshold))
                                            : std::nullopt);
    tools_.refresh();
}

void StatisticsPage::showState() {
    const auto& statistics = tools_.statistics();
    const bool there = statistics && statistics->count() > 0;
    const auto count = statistics ? static_cast<qulonglong>(statistics->count()) : 0;
    count_->setText(!statistics  ? QString()
                    : count == 1 ? QObject::tr("1 sweep")
                                 : QObject::tr("%1 sweeps").arg(count));
    save_->setEnabled(there);
    // Without a sweep the numbers along the axes mean nothing.
    for (QCPAxis* axis : {plot_->xAxis, plot_->yAxis}) axis->setTickLabels(there);
    if (!there) {
        for (int i = 0; i < kCurves; ++i) plot_->graph(i)->data()->clear();
    } else {
        const SpectrumTrace low = statistics->minimum();
        const QVector<double> x = vectorOf(low.x);
        QVector<double> share = vectorOf(statistics->occupancy());
        for (double& part : share) part *= 100;
        plot_->graph(0)->setData(x, vectorOf(statistics->maximum().level), true);
        plot_->graph(1)->setData(x, vectorOf(low.level), true);
        plot_->graph(2)->setData(x, vectorOf(statistics->mean().level), true);
        plot_->graph(3)->setData(x, share, true);
        qSharedPointerCast<DivisionTicker>(plot_->xAxis->ticker())->setUnit(low.xUnit);
        plot_->yAxis->setLabel(QString::fromStdString(low.unit));
        plot_->xAxis->rescale();
        plot_->yAxis->rescale();
    }
    if (isVisible()) plot_->replot(QCustomPlot::rpQueuedReplot);
}

}  // namespace zel
