#include "desktop/windows/Readouts.h"

#include <QFrame>
#include <QGridLayout>
#include <QHBoxLayout>
#include <string>

#include "desktop/binders/Binder.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/windows/StillLabel.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"

namespace zel {
namespace {

constexpr int kPaceWidth = 152;
constexpr int kRangeWidth = 138;  // "Center: 2.415 GHz"
constexpr int kPointerWidth = 92;
constexpr int kLineHeight = 17;
constexpr int kRoomForTrace = 760;  // else the marker's own text on the graph says it

QLabel* value() {
    auto* label = new QLabel;
    label->setProperty("readout", true);
    label->setTextFormat(Qt::PlainText);
    label->setMinimumHeight(kLineHeight);  // an empty one keeps its place
    return label;
}

QLabel* small(const QString& name = {}) {
    auto* label = new QLabel;
    label->setObjectName("caption");
    label->setTextFormat(Qt::PlainText);
    if (!name.isEmpty()) label->setAccessibleName(name);
    return label;
}

/// A frame with its grid of two rows.
QGridLayout* card(QHBoxLayout& row, int stretch) {
    auto* frame = new QFrame;
    frame->setObjectName("group");
    auto* grid = new QGridLayout(frame);
    grid->setContentsMargins(4, 4, 4, 4);
    grid->setHorizontalSpacing(8);
    grid->setVerticalSpacing(0);
    row.addWidget(frame, stretch);
    return grid;
}

/// The last part of a text whose parts stand apart goes to a line of its own.
QString inTwoLines(const std::string& parts) {
    QString text = ownText(parts);
    if (const qsizetype gap = text.lastIndexOf("   "); gap > 0) text.replace(gap, 3, "\n");
    return text;
}

}  // namespace

Readouts::Readouts(ControllerForm& panel, Binder& binder, QWidget* parent)
    : QWidget(parent),
      pointer_(value()),
      pointerLevel_(small(QObject::tr("Level of the trace under the pointer"))),
      atMarker_(small(QObject::tr("Trace at the marker"))),
      atDelta_(small(QObject::tr("Trace at the delta marker"))) {
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(4);
    const auto bound = [&binder](Label& control) {
        QLabel* label = value();
        binder.bind(control, label);
        return label;
    };
    QGridLayout* range = card(*row, 2);
    range->setColumnMinimumWidth(0, kRangeWidth);
    centre_ = bound(panel.CFLabel);
    span_ = bound(panel.SpanLabel);
    range->addWidget(centre_, 0, 0);
    range->addWidget(span_, 1, 0);
    QGridLayout* markers = card(*row, 5);
    markers->addWidget(bound(panel.MarkerLabel), 0, 0);
    markers->addWidget(atMarker_, 0, 1, Qt::AlignRight);
    markers->addWidget(bound(panel.DeltaLabel), 1, 0);
    markers->addWidget(atDelta_, 1, 1, Qt::AlignRight);
    markers->setColumnStretch(0, 1);
    QGridLayout* pointer = card(*row, 0);
    pointer_->setMinimumWidth(kPointerWidth);
    pointer_->setAccessibleName(QObject::tr("Position of the pointer"));
    pointer->addWidget(pointer_, 0, 0);
    pointer->addWidget(pointerLevel_, 1, 0);
    showPointer({}, {});
    showTrace({}, {});
    QGridLayout* pace = card(*row, 0);
    auto* line = new StillLabel(kPaceWidth, 2, 0);
    pace_ = line;
    line->setObjectName("caption");
    line->setTextFormat(Qt::PlainText);
    binder.bindShow(panel.PaceLabel, line, [&panel, line] {
        line->showText(inTwoLines(panel.PaceLabel.Caption));
        line->parentWidget()->setVisible(panel.PaceLabel.Visible && !panel.Shown.fromFile);
    });
    pace->addWidget(line, 0, 0, 2, 1);
}

void Readouts::showPointer(const QString& position, const QString& level) {
    const bool there = !position.isEmpty();
    pointer_->setText(there ? position : QString::fromUtf8("\u2013"));
    pointerLevel_->setText(there ? level : QObject::tr("Pointer"));
}

void Readouts::showTrace(const QString& atMarker, const QString& atDelta) {
    const bool room = width() >= kRoomForTrace;
    const auto show = [room](QLabel* label, const QString& text) {
        label->setText(text.isEmpty() ? text : QObject::tr("trace %1").arg(text));
        // A hidden one leaves its gap to the marker's text.
        label->setVisible(room && !text.isEmpty());
    };
    show(atMarker_, atMarker);
    show(atDelta_, atDelta);
}

void Readouts::showFile(bool fromFile) {
    for (QLabel* label : {centre_, span_}) setMark(label, "file", fromFile);
    // The age is that of the last sweep, which is not on the graph.
    pace_->parentWidget()->setVisible(!fromFile);
}

}  // namespace zel
