#include "desktop/windows/PanelSide.h"

#include <QCoreApplication>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QPainter>
#include <QPointer>
#include <QStyle>
#include <QVBoxLayout>
#include <cstddef>
#include <utility>

#include "desktop/binders/Binder.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/windows/FoldGroup.h"
#include "desktop/windows/KeyPictures.h"
#include "desktop/windows/Terminators.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "panel/EntryText.h"
#include "panel/SoftPositions.h"
#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {
namespace {

constexpr int kWithin = 4;  // pixels, between the parts of a group
constexpr int kBetween = 5;
constexpr int kTallestKey = 56;
constexpr int kSoftKeyWidth = 116;
constexpr int kOptionWidth = 16;  // without a text
constexpr int kShortestPosition = 36;
constexpr int kTallestSoftKey = 54;
constexpr int kModesInARow = 3;
constexpr int kLongestList = 16;  // no list of the panel is longer

template <class Layout>
Layout* layoutOf(QWidget* widget) {
    auto* layout = new Layout(widget);
    layout->setSpacing(kWithin);
    layout->setContentsMargins(0, 0, 0, 0);
    return layout;
}

/// Ends in dots where there is no room for all of it: no text makes the column wider.
class ShortLabel : public QLabel {
  public:
    ShortLabel() {
        setObjectName("caption");
        setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    }
    QSize minimumSizeHint() const override { return {0, QLabel::minimumSizeHint().height()}; }

  protected:
    void paintEvent(QPaintEvent*) override {
        QPainter painter(this);
        const QString shown = fontMetrics().elidedText(text(), Qt::ElideRight, width());
        style()->drawItemText(&painter, rect(), Qt::AlignRight | Qt::AlignVCenter, palette(),
                              isEnabled(), shown, foregroundRole());
    }
};

QLabel* smallCaption(const QString& text = {}) {
    auto* label = new QLabel(text);
    label->setObjectName("caption");
    return label;
}

}  // namespace

PanelSide::PanelSide(ControllerForm& panel, const ZEL3Variables& mirror, Binder& binder,
                     QWidget* parent)
    : QScrollArea(parent),
      panel_(panel),
      mirror_(mirror),
      binder_(binder),
      terminators_(new TerminatorRow(panel, mirror, binder)),
      column_(new QWidget),
      layout_(new QVBoxLayout(column_)) {
    setObjectName("panel");
    setAccessibleName(QObject::tr("Panel"));
    setFixedWidth(kWidth);
    setWidgetResizable(true);
    setFrameShape(QFrame::NoFrame);
    setFocusPolicy(Qt::NoFocus);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    column_->setObjectName("column");
    layout_->setSpacing(kBetween);
    layout_->setContentsMargins(8, 6, 8, 6);
    setWidget(column_);  // while it is empty: of a full one all sizes would be asked for
    layout_->addWidget(runKeys());
    layout_->addWidget(softPositions(), 5);
    layout_->addWidget(hardKeys(), 3);
    FoldGroup* modes = addGroup("Modes", QObject::tr("Mode"), modeKeys());
    FoldGroup* markers = addGroup("Markers", QObject::tr("Marker"), markerKeys());
    FoldGroup* command = addGroup("Command", QObject::tr("Command line"), commandLine());
    for (Button* control : {&panel_.ResetButton, &panel_.LocalButton, &panel_.OnOffButton})
        command->headingRow().addWidget(key(*control));
    // They were made after the lines below them.
    QWidget* before = &command->heading();
    for (Control* control :
         {static_cast<Control*>(&panel_.ResetButton), static_cast<Control*>(&panel_.LocalButton),
          static_cast<Control*>(&panel_.OnOffButton),
          static_cast<Control*>(&panel_.ManualCommandText)}) {
        auto* next = qobject_cast<QWidget*>(binder_.widgetOf(*control));
        setTabOrder(before, next);
        before = next;
    }
    groups_ = {markers, modes, command};
    layout_->addStretch(1);
}

FoldGroup* PanelSide::addGroup(const QString& name, const QString& caption, QWidget* content) {
    auto* group = new FoldGroup(name, caption, content);
    layout_->addWidget(group);
    connect(group, &FoldGroup::chosen, this, [this, group] {
        foldByRoom();
        emit folded();
        if (group->isOpen()) ensureWidgetVisible(group);
    });
    return group;
}

void PanelSide::resizeEvent(QResizeEvent* event) {
    QScrollArea::resizeEvent(event);
    foldByRoom();
}

void PanelSide::settle() {
    foldByRoom();
    layout_->activate();
    QCoreApplication::sendPostedEvents(this, QEvent::MetaCall);
}

void PanelSide::showState(bool viewRuns, bool fileShown) {
    QString text = QObject::tr("Soft key");
    if (fileShown) text = QObject::tr("Boxes: instrument, not file");
    if (viewRuns) text = QObject::tr("Stop the view to use the grey keys");
    reason_->setText(text);
    setMark(reason_, "file", fileShown && !viewRuns);
}

void PanelSide::foldByRoom() {
    int needed = layout_->minimumSize().height();
    for (const FoldGroup* group : groups_)
        if (group->isOpen()) needed -= group->contentHeight();
    for (const FoldGroup* group : groups_)
        if (group->choice() == FoldGroup::Choice::Open) needed += group->contentHeight();
    bool room = true;
    for (FoldGroup* group : groups_) {
        if (group->choice() != FoldGroup::Choice::ByRoom) continue;
        needed += group->contentHeight();
        room = room && needed <= viewport()->height();
        group->setOpen(room);
    }
}

QPushButton* PanelSide::key(Button& control, bool tall) {
    return fitted(new QPushButton, control, tall);
}

QPushButton* PanelSide::fitted(QPushButton* button, Button& control, bool tall) {
    button->setMinimumWidth(30);
    button->setSizePolicy(QSizePolicy::Preferred,
                          tall ? QSizePolicy::Expanding : QSizePolicy::Fixed);
    if (tall) button->setMaximumHeight(kTallestKey);
    binder_.bind(control, button);
    return button;
}

QWidget* PanelSide::runKeys() {
    auto* row = new QWidget;
    auto* layout = layoutOf<QHBoxLayout>(row);
    for (Button* control :
         {&panel_.PlaySingleButton, &panel_.PlayContinuousButton, &panel_.StopButton}) {
        QPushButton* button = key(*control);
        // Those that come and go leave the others where they are.
        QSizePolicy policy(QSizePolicy::Ignored, QSizePolicy::Fixed);
        policy.setRetainSizeWhenHidden(true);
        button->setSizePolicy(policy);
        layout->addWidget(button, 1);
    }
    return row;
}

bool PanelSide::readPosition(int index, QString& text, QString& problem) const {
    const EntryUnit unit = entryUnitOf(panel_, mirror_, index);
    // A name, or a value that was only read and is not sent again.
    if (unit == EntryUnit::Enter || panel_.SoftBoxFirstKey == 1) return true;
    // Of a marker's readout the position counts.
    const EntryReading reading = readEntry(text.section(';', 0, 0).toStdString(), unit);
    problem = ownText(reading.problem);
    if (reading.ok) text = QString::fromStdString(reading.text);
    return reading.ok;
}

QWidget* PanelSide::softPosition(int index) {
    auto* place = new QWidget;
    place->setMinimumHeight(kShortestPosition);
    auto* row = layoutOf<QHBoxLayout>(place);
    auto* button = key(panel_.SoftKey(index), true);
    button->setFixedWidth(kSoftKeyWidth);
    button->setProperty("soft", true);  // two lines high at least
    button->setMaximumHeight(kTallestSoftKey);
    QSizePolicy policy = button->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    button->setSizePolicy(policy);
    row->addWidget(button);
    auto* beside = new QVBoxLayout;
    beside->setSpacing(1);
    QLabel* caption = smallCaption();
    beside->addStretch(1);
    auto* head = new QHBoxLayout;
    head->addWidget(caption);
    QLabel* refusal = new ShortLabel;
    refusal->setProperty("problem", true);
    refusal->setAccessibleName(QObject::tr("Refusal"));
    refusals_.at(static_cast<std::size_t>(index)) = refusal;
    head->addWidget(refusal, 1);
    beside->addLayout(head);
    auto* fields = new QWidget;
    auto* places = layoutOf<QHBoxLayout>(fields);
    auto* box = new PanelLineEdit;
    auto* list = new QComboBox;
    list->setMaxVisibleItems(kLongestList);
    // What a menu shows here does not move the keys: the place is the same for all.
    for (QWidget* field : {static_cast<QWidget*>(box), static_cast<QWidget*>(list)}) {
        field->setMinimumWidth(40);
        field->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
        places->addWidget(field, 1);
    }
    binder_.bind(panel_.SoftTextBox(index), box);
    box->setReader([this, index](QString& text, QString& problem) {
        return readPosition(index, text, problem);
    });
    binder_.bind(panel_.ChoiceBox(index), list);
    // A menu may leave the caption of another one over a place without a box.
    const auto show = [&frame = panel_.SoftFrame(index), &text = panel_.SoftTextBox(index),
                       &choice = panel_.ChoiceBox(index), caption, fields] {
        caption->setText(QString::fromStdString(frame.Caption));
        caption->setVisible(frame.Visible && (text.Visible || choice.Visible));
        fields->setVisible(frame.Visible);
    };
    binder_.bindShow(panel_.SoftFrame(index), fields, show);
    for (Control* field : {static_cast<Control*>(&panel_.SoftTextBox(index)),
                           static_cast<Control*>(&panel_.ChoiceBox(index))})
        field->Changed.connect([self = QPointer<PanelSide>(this), index] {
            if (self) self->binder_.refresh(self->panel_.SoftFrame(index));
        });
    beside->addWidget(fields);
    beside->addStretch(1);
    row->addLayout(beside, 1);
    return place;
}

QWidget* PanelSide::softPositions() {
    auto* group = new QWidget;
    auto* layout = layoutOf<QVBoxLayout>(group);
    auto* options = new QHBoxLayout;
    // Beside the key that stops: why keys are grey.
    reason_ = smallCaption(QObject::tr("Soft key"));
    options->addWidget(reason_);
    options->addStretch(1);
    for (OptionButton* control : {&panel_.GetOption, &panel_.SetOption}) {
        auto* option = new QRadioButton;
        binder_.bind(*control, option);
        options->addWidget(option);
    }
    layout->addLayout(options);
    for (int i = 0; i < panel_.SoftKey.count(); ++i) layout->addWidget(softPosition(i), 1);
    layout->addWidget(terminators_);
    return group;
}

QWidget* PanelSide::hardKeys() {
    auto* group = new QWidget;
    auto* layout = layoutOf<QGridLayout>(group);
    Button* keys[] = {&panel_.FrequencyButton, &panel_.SpanButton,   &panel_.AmplitudeButton,
                      &panel_.BWButton,        &panel_.SweepButton,  &panel_.TraceButton,
                      &panel_.MeasButton,      &panel_.TrackButton1, &panel_.MarkerButton};
    int place = 0;
    for (Button* control : keys) {
        layout->addWidget(fitted(new PictureKey, *control, true), place / 3, place % 3);
        ++place;
    }
    return group;
}

QWidget* PanelSide::modeKeys() {
    auto* group = new QWidget;
    auto* layout = layoutOf<QGridLayout>(group);
    const std::pair<Button*, OptionButton*> modes[] = {
        {&panel_.AnalyzerButton, &panel_.AnalyzerCheck},
        {&panel_.TrackButton, &panel_.TrackingGenCheck},
        {&panel_.PwrButton, &panel_.PowerSensorCheck},
        {&panel_.ChnPwrButton, &panel_.ChannelPowerCheck},
        {&panel_.OccBWButton, &panel_.OccBWCheck},
        {&panel_.TDMAButton, &panel_.TDMAPowerCheck},
        {&panel_.DistFaultButton, &panel_.DistFaultCheck},
    };
    int place = 0;
    for (const auto& [button, option] : modes) {
        auto* pair = new QWidget;
        auto* row = layoutOf<QHBoxLayout>(pair);
        row->setSpacing(2);
        auto* check = new QRadioButton;
        binder_.bind(*option, check);
        check->setFixedWidth(kOptionWidth);
        row->addWidget(check);
        QPushButton* mode = key(*button);
        mode->setProperty("narrow", true);
        row->addWidget(mode, 1);
        layout->addWidget(pair, place / kModesInARow, place % kModesInARow);
        ++place;
    }
    for (int i = 0; i < kModesInARow; ++i) layout->setColumnStretch(i, 1);
    return group;
}

QWidget* PanelSide::markerKeys() {
    auto* group = new QWidget;
    auto* layout = layoutOf<QGridLayout>(group);
    // In the order of reading, which Tab follows.
    const auto check = [&](CheckBox& control, int row) {
        auto* box = new QCheckBox;
        binder_.bind(control, box);
        layout->addWidget(box, row, 0);
    };
    check(panel_.MarkerCheckBox, 0);
    layout->addWidget(key(panel_.MarkPkButton), 0, 1, 1, 2);
    layout->addWidget(key(panel_.NextPeakButton), 0, 3, 1, 2);
    layout->addWidget(key(panel_.MinPeakButton), 0, 5, 1, 2);
    check(panel_.DeltaCheckBox, 1);
    layout->addWidget(key(panel_.MarkToCentButton), 1, 1, 1, 3);
    layout->addWidget(key(panel_.MarkToRefButton), 1, 4, 1, 3);
    for (int i = 1; i <= 6; ++i) layout->setColumnStretch(i, 1);
    return group;
}

QWidget* PanelSide::commandLine() {
    auto* group = new QWidget;
    auto* layout = layoutOf<QGridLayout>(group);
    auto* line = new PanelLineEdit;
    binder_.bind(panel_.ManualCommandText, line);
    layout->addWidget(line, 0, 0);
    layout->addWidget(key(panel_.SendButton), 0, 1);
    auto* answer = new PanelLineEdit;
    answer->setPlaceholderText(QObject::tr("Answer"));
    binder_.bind(panel_.ManualCommandTextAnsw, answer);
    layout->addWidget(answer, 1, 0, 1, 2);
    layout->setColumnStretch(0, 1);
    return group;
}

}  // namespace zel
