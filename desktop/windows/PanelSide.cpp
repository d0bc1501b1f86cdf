#include "desktop/windows/PanelSide.h"

#include <QFrame>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QVBoxLayout>

#include "desktop/windows/KeyPictures.h"

namespace zel {
namespace {

constexpr int kSpacing = 5;
constexpr int kTallest = 112;
constexpr int kFieldWidth = 120;
constexpr int kLongestList = 16;  // no list of the panel is longer

QFrame* group() {
    auto* frame = new QFrame;
    frame->setObjectName("group");
    return frame;
}

template <class Layout>
Layout* layoutOf(QWidget* widget) {
    auto* layout = new Layout(widget);
    layout->setSpacing(kSpacing);
    layout->setContentsMargins(kSpacing, kSpacing, kSpacing, kSpacing);
    return layout;
}

QLabel* smallCaption(const QString& text = {}) {
    auto* label = new QLabel(text);
    label->setObjectName("caption");
    return label;
}

}  // namespace

PanelSide::PanelSide(ControllerForm& panel, const ZEL3Variables& mirror, Binder& binder,
                     QWidget* parent)
    : QWidget(parent),
      panel_(panel),
      binder_(binder),
      terminators_(new TerminatorRow(panel, mirror, binder)) {
    auto* layout = new QVBoxLayout(this);
    layout->setSpacing(kSpacing);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(playKeys());
    auto* middle = new QHBoxLayout;
    middle->setSpacing(kSpacing);
    middle->addWidget(softPositions(), 5);
    auto* right = new QVBoxLayout;
    right->setSpacing(kSpacing);
    right->addWidget(hardKeys(), 5);
    right->addWidget(modeKeys(), 6);
    middle->addLayout(right, 5);
    layout->addLayout(middle, 1);
    layout->addWidget(markerKeys());
    layout->addWidget(instrumentKeys());
}

QPushButton* PanelSide::key(Button& control, bool tall) {
    return fitted(new QPushButton, control, tall);
}

QPushButton* PanelSide::fitted(QPushButton* button, Button& control, bool tall) {
    button->setMinimumWidth(30);
    button->setSizePolicy(QSizePolicy::Preferred,
                          tall ? QSizePolicy::Expanding : QSizePolicy::Fixed);
    if (tall) button->setMaximumHeight(kTallest);
    binder_.bind(control, button);
    return button;
}

QWidget* PanelSide::playKeys() {
    QFrame* frame = group();
    auto* layout = layoutOf<QHBoxLayout>(frame);
    for (Button* control :
         {&panel_.PlaySingleButton, &panel_.PlayContinuousButton, &panel_.StopButton,
          &panel_.cmdZoom, &panel_.cmd3D, &panel_.cmdSpecial}) {
        QPushButton* button = key(*control);
        // Where the row is tight each key still shows its whole caption.
        button->setMinimumWidth(0);
        button->setSizePolicy(QSizePolicy::Minimum, QSizePolicy::Fixed);
        layout->addWidget(button);
    }
    return frame;
}

QWidget* PanelSide::softPositions() {
    QFrame* frame = group();
    auto* layout = layoutOf<QVBoxLayout>(frame);
    auto* options = new QHBoxLayout;
    options->addWidget(smallCaption("Soft key"));
    for (OptionButton* control : {&panel_.GetOption, &panel_.SetOption}) {
        auto* option = new QRadioButton;
        binder_.bind(*control, option);
        options->addWidget(option);
    }
    options->addStretch(1);
    layout->addLayout(options);
    for (int i = 0; i < panel_.SoftKey.count(); ++i) {
        auto* row = new QGridLayout;
        row->setSpacing(3);
        auto* button = key(panel_.SoftKey(i), true);
        button->setMinimumSize(78, 40);
        QSizePolicy policy = button->sizePolicy();
        policy.setHorizontalPolicy(QSizePolicy::Ignored);
        policy.setRetainSizeWhenHidden(true);
        button->setSizePolicy(policy);
        row->addWidget(button, 0, 0, 2, 1);
        QLabel* caption = smallCaption();
        caption->setMinimumWidth(kFieldWidth);
        row->addWidget(caption, 0, 1, 1, 2, Qt::AlignBottom);
        auto* fields = new QWidget;
        auto* places = new QHBoxLayout(fields);
        places->setContentsMargins(0, 0, 0, 0);
        places->setSpacing(3);
        auto* box = new PanelLineEdit;
        auto* list = new QComboBox;
        list->setMaxVisibleItems(kLongestList);
        // What a menu shows here does not move the keys: the place is the same for all.
        for (QWidget* field : {static_cast<QWidget*>(box), static_cast<QWidget*>(list)}) {
            field->setMinimumWidth(40);
            field->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Fixed);
        }
        places->addWidget(box, 1);
        places->addWidget(list, 1);
        binder_.bind(panel_.SoftTextBox(i), box);
        binder_.bind(panel_.ChoiceBox(i), list);
        binder_.bind(panel_.SoftFrame(i), fields, caption);
        row->addWidget(fields, 1, 1, 1, 2, Qt::AlignTop);
        row->setColumnStretch(0, 2);
        row->setColumnStretch(1, 3);
        row->setColumnMinimumWidth(1, kFieldWidth);
        layout->addLayout(row, 1);
    }
    layout->addWidget(terminators_);
    return frame;
}

QWidget* PanelSide::hardKeys() {
    QFrame* frame = group();
    auto* layout = layoutOf<QGridLayout>(frame);
    Button* keys[] = {&panel_.FrequencyButton, &panel_.SpanButton,   &panel_.AmplitudeButton,
                      &panel_.BWButton,        &panel_.SweepButton,  &panel_.TraceButton,
                      &panel_.MeasButton,      &panel_.TrackButton1, &panel_.MarkerButton};
    int place = 0;
    for (Button* control : keys) {
        layout->addWidget(fitted(new PictureKey, *control, true), place / 3, place % 3);
        ++place;
    }
    return frame;
}

QWidget* PanelSide::modeKeys() {
    QFrame* frame = group();
    auto* layout = layoutOf<QGridLayout>(frame);
    layout->setVerticalSpacing(2);
    const std::pair<Button*, OptionButton*> modes[] = {
        {&panel_.AnalyzerButton, &panel_.AnalyzerCheck},
        {&panel_.TrackButton, &panel_.TrackingGenCheck},
        {&panel_.PwrButton, &panel_.PowerSensorCheck},
        {&panel_.ChnPwrButton, &panel_.ChannelPowerCheck},
        {&panel_.OccBWButton, &panel_.OccBWCheck},
        {&panel_.TDMAButton, &panel_.TDMAPowerCheck},
        {&panel_.DistFaultButton, &panel_.DistFaultCheck},
    };
    int row = 0;
    for (const auto& [button, option] : modes) {
        auto* check = new QRadioButton;
        binder_.bind(*option, check);
        layout->addWidget(check, row, 0);
        layout->addWidget(key(*button, true), row, 1);
        ++row;
    }
    layout->setColumnStretch(1, 1);
    return frame;
}

QWidget* PanelSide::markerKeys() {
    QFrame* frame = group();
    auto* layout = layoutOf<QGridLayout>(frame);
    int column = 0;
    for (CheckBox* control : {&panel_.MarkerCheckBox, &panel_.DeltaCheckBox}) {
        auto* check = new QCheckBox;
        binder_.bind(*control, check);
        layout->addWidget(check, column++, 0);
    }
    layout->addWidget(key(panel_.MarkPkButton), 0, 1);
    layout->addWidget(key(panel_.NextPeakButton), 0, 2);
    layout->addWidget(key(panel_.MinPeakButton), 0, 3);
    layout->addWidget(key(panel_.MarkToCentButton), 1, 1, 1, 2);
    layout->addWidget(key(panel_.MarkToRefButton), 1, 3);
    for (int i = 1; i <= 3; ++i) layout->setColumnStretch(i, 1);
    return frame;
}

QWidget* PanelSide::instrumentKeys() {
    QFrame* frame = group();
    auto* layout = layoutOf<QGridLayout>(frame);
    layout->addWidget(key(panel_.ResetButton), 0, 0);
    layout->addWidget(key(panel_.LocalButton), 0, 1);
    layout->addWidget(key(panel_.OnOffButton), 0, 2);
    auto* line = new PanelLineEdit;
    binder_.bind(panel_.ManualCommandText, line);
    layout->addWidget(line, 0, 3);
    layout->addWidget(key(panel_.SendButton), 0, 4);
    auto* answer = new PanelLineEdit;
    answer->setPlaceholderText("Answer");
    binder_.bind(panel_.ManualCommandTextAnsw, answer);
    layout->addWidget(answer, 1, 0, 1, 5);
    layout->setColumnStretch(3, 1);
    return frame;
}

}  // namespace zel
