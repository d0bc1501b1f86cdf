#include "desktop/windows/EntryMarks.h"

#include <QComboBox>
#include <QPointer>
#include <array>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <optional>
#include <string>
#include <utility>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "model/UnsureSettings.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "shell/Program.h"

namespace zel {
namespace {

using CF = ControllerForm;

/// By the digit of the answer.
constexpr const char* kRefusals[] = {
    QT_TRANSLATE_NOOP("QObject", "refused"),
    QT_TRANSLATE_NOOP("QObject", "refused: not understood"),
    QT_TRANSLATE_NOOP("QObject", "refused: not in this mode"),
    QT_TRANSLATE_NOOP("QObject", "refused: storage full"),
    QT_TRANSLATE_NOOP("QObject", "refused: not allowed"),
    QT_TRANSLATE_NOOP("QObject", "refused: out of range"),
};
constexpr int kKnownRefusals = static_cast<int>(std::size(kRefusals));

struct Rest {
    std::int16_t state;
    int box;
    bool onCentre;
    bool onSpan;
    bool onLevel;
};
/// What the boxes of the menus rest on.
constexpr Rest kRests[] = {
    {CF::Freq, 0, true, false, false}, {CF::Freq, 1, false, true, false},
    {CF::Freq, 2, true, true, false},  {CF::Freq, 3, true, true, false},
    {CF::SPAN, 0, false, true, false}, {CF::AMPT, 0, false, false, true},
};

const Rest* restOf(std::int16_t state, int box) {
    for (const Rest& row : kRests)
        if (row.state == state && row.box == box) return &row;
    return nullptr;
}

/// Only the choice is struck: the entries that open below it can be chosen as ever.
void plainEntries(QComboBox& list, bool set) {
    QFont font = list.font();
    font.setStrikeOut(false);
    for (int i = 0; i < list.count(); ++i)
        list.setItemData(i, set ? QVariant(font) : QVariant(), Qt::FontRole);
}

}  // namespace

EntryMarks::EntryMarks(Program& program, Binder& binder,
                       const std::array<QLabel*, kBoxes>& refusals, QObject* parent)
    : QObject(parent),
      panel_(program.forms().controller),
      mirror_(program.variables()),
      binder_(binder),
      refusals_(refusals) {
    const QPointer<EntryMarks> self(this);
    for (int box = 0; box < kBoxes; ++box) follow(box);
    program.SettingRefused.connect([self](int status) {
        if (self) self->refused(status);
    });
    program.variables().Unsure.Changed.connect([self] {
        if (self) self->takeUnsure();
    });
}

void EntryMarks::follow(int box) {
    const QPointer<EntryMarks> self(this);
    TextBox& text = panel_.SoftTextBox(box);
    // The panel's own handlers send the value at KeyPress; that of this class runs after them.
    text.KeyDown.connect([self, box](int key, int) {
        if (self && key == kKeyEnter) self->entering_ = box;
    });
    text.KeyPress.connect([self](int& key) {
        if (self && key == kKeyEnter) self->entering_ = -1;
    });
    const auto changed = [self, box] {
        if (!self) return;
        if (self->panel_.State != self->state_) return self->takeMenu();
        const Mark& mark = self->marks_.at(static_cast<std::size_t>(box));
        if (!mark.reason.isEmpty() && self->shownText(box) != mark.text && !mark.onAxis)
            self->clear(box);
    };
    text.Changed.connect(changed);
    panel_.ChoiceBox(box).Changed.connect(changed);
    // The panel's own handler sends the choice; this one comes after it.
    panel_.ChoiceBox(box).Clicked.connect([self, box] {
        if (self) self->chosen(box);
    });
}

void EntryMarks::chosen(int box) {
    const std::optional<int> status = std::exchange(refusedChoice_, std::nullopt);
    if (!status) return;
    entering_ = box;
    refused(*status);
    entering_ = -1;
}

std::string EntryMarks::shownText(int box) const {
    const DropDownList& list = panel_.ChoiceBox(box);
    return list.Visible ? list.Text() : panel_.SoftTextBox(box).Text.get();
}

/// The boxes are those of another menu.
void EntryMarks::takeMenu() {
    state_ = panel_.State;
    for (int box = 0; box < kBoxes; ++box) clear(box);
    takeUnsure();
}

void EntryMarks::refused(int status) {
    if (entering_ < 0) {
        if (panel_.ChoiceBoxActivated) refusedChoice_ = status;
        return;
    }
    if (panel_.State != state_) takeMenu();
    const int row = status > 0 && status < kKnownRefusals ? status : 0;
    const Rest* rest = restOf(panel_.State, entering_);
    mark(entering_, QObject::tr(kRefusals[row]), rest != nullptr);
}

bool EntryMarks::restsOnUnsure(int box) const {
    const Rest* rest = restOf(panel_.State, box);
    const UnsureSettings& unsure = mirror_.Unsure;
    return rest != nullptr && ((rest->onCentre && unsure.has(AxisSetting::Frequency)) ||
                               (rest->onSpan && unsure.has(AxisSetting::Span)) ||
                               (rest->onLevel && unsure.has(AxisSetting::ReferenceLevel)));
}

void EntryMarks::takeUnsure() {
    const UnsureSettings& unsure = mirror_.Unsure;
    const bool now = unsure.has(AxisSetting::Frequency) || unsure.has(AxisSetting::Span) ||
                     unsure.has(AxisSetting::ReferenceLevel);
    for (int box = 0; box < kBoxes; ++box) {
        const Mark& old = marks_.at(static_cast<std::size_t>(box));
        if (restsOnUnsure(box) && old.reason.isEmpty()) mark(box, QObject::tr("unsure"), true);
        if (!restsOnUnsure(box) && !old.reason.isEmpty() && old.onAxis) clear(box);
    }
    // The mirror takes the answer after this.
    if (unsure_ && !now)
        QMetaObject::invokeMethod(
            this, [this] { showInstrument(); }, Qt::QueuedConnection);
    unsure_ = now;
}

/// The mirror holds what the instrument answered: so do the boxes.
void EntryMarks::showInstrument() {
    const auto put = [this](int box, const std::string& text) {
        if (panel_.SoftTextBox(box).Visible) panel_.SoftTextBox(box).Text = text;
    };
    const auto hertz = [](double value) { return FormatValue(value, "Hz"); };
    const double half = mirror_.Span / 2;
    if (panel_.State == CF::Freq) {
        put(0, hertz(mirror_.CenterFrequency));
        put(1, hertz(mirror_.Span));
        put(2, hertz(mirror_.CenterFrequency - half));
        put(3, hertz(mirror_.CenterFrequency + half));
    } else if (panel_.State == CF::SPAN) {
        put(0, hertz(mirror_.Span));
    } else if (panel_.State == CF::AMPT) {
        put(0, FormatValue(mirror_.ReferenceLevel, levelUnitText(mirror_.ReferenceUnit), "",
                           mirror_.ReferenceUnit > UNITDB));
    }
}

void EntryMarks::mark(int box, const QString& reason, bool onAxis) {
    marks_.at(static_cast<std::size_t>(box)) = {reason, shownText(box), onAxis};
    show(box);
}

void EntryMarks::clear(int box) {
    marks_.at(static_cast<std::size_t>(box)) = {};
    show(box);
}

void EntryMarks::show(int box) {
    const QString& reason = marks_.at(static_cast<std::size_t>(box)).reason;
    QLabel* beside = refusals_.at(static_cast<std::size_t>(box));
    beside->setText(reason);
    beside->setToolTip(reason);
    for (const Control* control : {static_cast<const Control*>(&panel_.SoftTextBox(box)),
                                   static_cast<const Control*>(&panel_.ChoiceBox(box))})
        if (auto* field = qobject_cast<QWidget*>(binder_.widgetOf(*control)))
            setMark(field, "struck", !reason.isEmpty());
    auto* list = qobject_cast<QComboBox*>(binder_.widgetOf(panel_.ChoiceBox(box)));
    if (list != nullptr) plainEntries(*list, !reason.isEmpty());
}

}  // namespace zel
