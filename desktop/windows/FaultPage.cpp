#include "desktop/windows/FaultPage.h"

#include <QGridLayout>
#include <QHeaderView>
#include <cstddef>
#include <optional>
#include <vector>

#include "analysis/Correction.h"
#include "analysis/Peaks.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceTools.h"
#include "desktop/windows/TracePage.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kDecimals = 3;

QLineEdit* field(const QString& name, const QString& text) {
    auto* box = new QLineEdit(text);
    box->setObjectName(name);
    box->setMaximumWidth(72);
    return box;
}

/// A velocity factor: above 0, 1 at most.
std::optional<double> factorOf(const QLineEdit& box) {
    const auto value = parseNumber(box.text().trimmed().toStdString());
    return value && *value > 0 && *value <= 1 ? value : std::nullopt;
}

QString metres(double x) {
    return QString::fromStdString(generalNumber(roundHalfEven(x, kDecimals))) + " m";
}

}  // namespace

FaultPage::FaultPage(TraceTools& tools) : TracePage(tools) {
    auto* grid = new QGridLayout(this);
    grid->setColumnStretch(1, 1);
    const std::vector<VelocityFactor>& list = velocityFactors();
    const QString first = QString::fromStdString(generalNumber(list.front().factor));
    assumed_ = field("AssumedFactor", first);
    factor_ = field("CableFactor", first);
    cable_ = new QComboBox;
    cable_->setObjectName("Cable");
    for (const VelocityFactor& row : list)
        cable_->addItem(QString::fromUtf8(row.dielectric) + ", " +
                        QString::fromStdString(generalNumber(row.factor)));
    cable_->addItem(QObject::tr("Another one"));
    const auto caption = [grid](int row, const QString& text, QWidget* of) {
        auto* label = new QLabel(text);
        label->setBuddy(of);
        grid->addWidget(label, row, 0);
    };
    caption(0, QObject::tr("The instrument counts with the velocity factor"), assumed_);
    grid->addWidget(assumed_, 0, 1, Qt::AlignLeft);
    caption(1, QObject::tr("The cable is of"), cable_);
    grid->addWidget(cable_, 1, 1);
    caption(2, QObject::tr("with the velocity factor"), factor_);
    grid->addWidget(factor_, 2, 1, Qt::AlignLeft);
    table_ = new QTableWidget(0, 4);
    table_->setObjectName("FaultTable");
    table_->setAccessibleName(QObject::tr("Faults"));
    table_->setHorizontalHeaderLabels({QObject::tr("Peak"), QObject::tr("Shown"),
                                       QObject::tr("In this cable"), QObject::tr("Level")});
    table_->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    table_->verticalHeader()->setVisible(false);
    table_->verticalHeader()->setDefaultSectionSize(24);
    table_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    grid->addWidget(table_, 3, 0, 1, 2);
    word_ = new QLabel;
    word_->setObjectName("FaultWord");
    word_->setWordWrap(true);
    grid->addWidget(word_, 4, 0, 1, 2);
    connect(cable_, &QComboBox::activated, this, [this](int place) {
        const std::vector<VelocityFactor>& cables = velocityFactors();
        const auto at = static_cast<std::size_t>(place);
        if (at < cables.size())
            factor_->setText(QString::fromStdString(generalNumber(cables[at].factor)));
        showState();
    });
    connect(factor_, &QLineEdit::textEdited, this, [this] {
        cable_->setCurrentIndex(cable_->count() - 1);
        showState();
    });
    connect(assumed_, &QLineEdit::textEdited, this, [this] { showState(); });
    showState();
}

void FaultPage::showState() {
    const AnalysisResult& result = tools_.result();
    const auto assumed = factorOf(*assumed_);
    const auto factor = factorOf(*factor_);
    const bool distances = tools_.trace() && tools_.trace()->xUnit == "m";
    QString word;
    if (!assumed || !factor) {
        word = QObject::tr("A velocity factor is above 0 and 1 at most.");
    } else if (!distances) {
        word = QObject::tr("There are distances when the instrument measures Distance to Fault.");
    }
    word_->setText(word);
    const bool shown = word.isEmpty();
    table_->setRowCount(shown ? static_cast<int>(result.peaks.size()) : 0);
    for (int row = 0; row < table_->rowCount(); ++row) {
        const Peak& peak = result.peaks[static_cast<std::size_t>(row)];
        const QStringList texts = {QString::number(row + 1), metres(peak.x),
                                   metres(faultDistance(peak.x, *assumed, *factor)),
                                   levelText(peak.level, result.unit)};
        for (int column = 0; column < static_cast<int>(texts.size()); ++column) {
            if (table_->item(row, column) == nullptr)
                table_->setItem(row, column, new QTableWidgetItem);
            table_->item(row, column)->setText(texts[column]);
        }
    }
}

}  // namespace zel
