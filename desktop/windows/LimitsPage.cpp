#include "desktop/windows/LimitsPage.h"

#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>
#include <optional>
#include <stdexcept>
#include <utility>
#include <vector>

#include "analysis/Correction.h"
#include "analysis/Mask.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceTools.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/windows/TracePage.h"

namespace zel {
namespace {

QPushButton* key(QHBoxLayout& row, const QString& text) {
    auto* button = new QPushButton(text);
    row.addWidget(button);
    return button;
}

}  // namespace

LimitsPage::LimitsPage(TraceTools& tools) : TracePage(tools) {
    auto* layout = new QVBoxLayout(this);
    auto* caption = new QLabel(QObject::tr("Mask: a row a point, x in Hz; a level may be empty"));
    layout->addWidget(caption);
    table_ = new QPlainTextEdit;
    table_->setObjectName("MaskTable");
    table_->setAccessibleName(QObject::tr("Mask"));
    table_->setTabChangesFocus(true);
    table_->setPlainText("x;upper;lower\n");
    caption->setBuddy(table_);
    layout->addWidget(table_, 1);
    auto* masks = new QHBoxLayout;
    connect(key(*masks, QObject::tr("Apply")), &QPushButton::clicked, this,
            [this] { applyMask(table_->toPlainText()); });
    connect(key(*masks, QObject::tr("Load...")), &QPushButton::clicked, this, [this] {
        const auto text = readTable(*this, QObject::tr("Load Mask"), nullptr);
        if (!text) return;
        table_->setPlainText(*text);
        applyMask(*text);
    });
    connect(key(*masks, QObject::tr("Save...")), &QPushButton::clicked, this,
            [this] { saveTable(*this, QObject::tr("Save Mask"), table_->toPlainText()); });
    connect(key(*masks, QObject::tr("Remove")), &QPushButton::clicked, this, [this] {
        word_->clear();
        tools_.setMask(std::nullopt);
    });
    masks->addStretch();
    layout->addLayout(masks);
    verdict_ = new QLabel;
    verdict_->setObjectName("MaskVerdict");
    layout->addWidget(verdict_);
    corrections_ = new QLabel;
    corrections_->setWordWrap(true);
    layout->addWidget(corrections_);
    auto* tables = new QHBoxLayout;
    constexpr std::pair<CorrectionKind, const char*> kKinds[] = {
        {CorrectionKind::Antenna, QT_TRANSLATE_NOOP("QObject", "Antenna...")},
        {CorrectionKind::Cable, QT_TRANSLATE_NOOP("QObject", "Cable...")},
        {CorrectionKind::Amplifier, QT_TRANSLATE_NOOP("QObject", "Amplifier...")}};
    for (const auto& [kind, text] : kKinds)
        connect(key(*tables, QObject::tr(text)), &QPushButton::clicked, this, [this, which = kind] {
            QString name;
            if (const auto table = readTable(*this, QObject::tr("Load Correction"), &name))
                addCorrection(which, name, *table);
        });
    connect(key(*tables, QObject::tr("Remove")), &QPushButton::clicked, this, [this] {
        word_->clear();
        tools_.setCorrections({});
    });
    tables->addStretch();
    layout->addLayout(tables);
    word_ = new QLabel;
    word_->setObjectName("LimitsWord");
    word_->setWordWrap(true);
    layout->addWidget(word_);
    showState();
}

void LimitsPage::applyMask(const QString& table) {
    try {
        Mask mask = readMask(table.toStdString());
        word_->clear();
        tools_.setMask(std::move(mask));
    } catch (const std::runtime_error& wrong) {
        word_->setText(QObject::tr("The mask was not taken, %1").arg(wrong.what()));
    }
}

void LimitsPage::addCorrection(CorrectionKind kind, const QString& name, const QString& table) {
    try {
        std::vector<Correction> all = tools_.corrections();
        all.push_back(readCorrection(table.toStdString(), kind, name.toStdString()));
        word_->clear();
        tools_.setCorrections(std::move(all));
    } catch (const std::runtime_error& wrong) {
        word_->setText(QObject::tr("The correction was not taken, %1").arg(wrong.what()));
    }
}

void LimitsPage::showState() {
    const AnalysisResult& result = tools_.result();
    QString verdict = tools_.request.mask ? QObject::tr("No sweep was held against the mask yet")
                                          : QObject::tr("No mask");
    if (result.mask) {
        verdict = result.mask->pass ? QObject::tr("Pass") : QObject::tr("FAIL");
        verdict += result.mask->margin ? QObject::tr(", margin %1 at %2")
                                             .arg(levelText(result.mask->margin, "dB"),
                                                  placeText(result.mask->x, tools_.trace()))
                                       : QObject::tr(", no sample covered");
    }
    if (tools_.maskCount().sweeps > 0) verdict += "; " + ownText(tools_.maskCount().text());
    verdict_->setText(verdict);
    const std::string names = correctionNames(tools_.corrections());
    corrections_->setText(names.empty()
                              ? QObject::tr("No correction: tables x;db over frequency")
                              : QObject::tr("Corrected: %1").arg(QString::fromStdString(names)));
}

}  // namespace zel
