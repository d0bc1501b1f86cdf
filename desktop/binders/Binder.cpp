#include "desktop/binders/Binder.h"

#include <QMenu>
#include <QSignalBlocker>
#include <QVariant>
#include <algorithm>
#include <functional>
#include <string>
#include <unordered_set>
#include <utility>

#include "desktop/binders/EventGuards.h"
#include "desktop/binders/OwnTexts.h"
#include "desktop/binders/ShortcutTable.h"
#include "desktop/binders/ToolTips.h"
#include "desktop/style/PanelStyle.h"
#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {
namespace {

struct Face {
    Color color;
    const char* name;
};
constexpr Face kFaces[] = {{kRed, "red"},       {kGreen, "green"},   {65280, "green"},
                           {14737632, "plain"}, {0xE0E0E0, "plain"}, {0x80FF80, "green"}};

QString text(const std::string& utf8) { return QString::fromStdString(utf8); }

/// A caption of two lines on a button; "&" is no mnemonic here.
QString caption(const Control& control, const std::string& utf8) {
    return ownCaption(control, utf8).replace("\r\n", "\n").replace("&", "&&");
}

/// Keys without a handler belong to rooms that are not built yet.
template <class T>
bool hasHandler(const T& control) {
    return control.Clicked.connected();
}

}  // namespace

QString faceOf(Color color) {
    for (const Face& face : kFaces)
        if (face.color == color) return face.name;
    return "plain";
}

void setMark(QWidget* widget, const char* name, bool on) {
    if (widget->property(name).toBool() == on) return;
    widget->setProperty(name, on);
    restyle(*widget);
}

void setFace(QWidget* widget, const QString& face) {
    if (widget->property("face").toString() == face) return;
    widget->setProperty("face", face);
    restyle(*widget);
}

void setInk(QWidget* widget, Color color) {
    const QColor ink = color == kWindowText ? QColor() : inkOf(color);
    if (widget->property("ink").value<QColor>() == ink) return;
    widget->setProperty("ink", ink.isValid() ? QVariant(ink) : QVariant());
    restyle(*widget);
}

Binder::Binder(QObject* parent) : QObject(parent) {
    frame_.setSingleShot(true);
    connect(&frame_, &QTimer::timeout, this, [this] { flush(); });
}

bool Binder::refused(const Control& control) const { return refuses && refuses(control); }

void Binder::act(const Control& control, std::function<void()> work) const {
    // By the time of its turn a control may be gone from the window.
    const auto checked = [&control, work = std::move(work)] {
        if (control.Visible && control.Enabled) work();
    };
    // The toolkit that called is not made for exceptions: what it holds would be lost.
    try {
        if (perform) {
            perform(control, checked);
        } else if (!refused(control)) {
            checked();
        }
    } catch (...) {
        if (!failed) throw;
        failed();
    }
}

void Binder::note(const Control& control, const char* act, const std::string& rest) const {
    if (!tell) return;
    const std::string& form = control.form().name();
    const std::string name =
        form == "ControllerForm" ? control.name() : form + "." + control.name();
    tell(act, rest.empty() ? name : name + " " + rest);
}

QObject* Binder::widgetOf(const Control& control) const {
    const auto found = entries_.find(&control);
    return found == entries_.end() ? nullptr : found->second.widget;
}

QString Binder::reasonFor(const Control& control) const {
    if (const auto found = blocked_.find(&control); found != blocked_.end())
        return text(found->second);
    return reasonAgainst ? text(reasonAgainst(control)).replace("\r\n", "\n") : QString();
}

void Binder::block(const Control& control, const std::string& reason) {
    if (reason.empty()) {
        if (blocked_.erase(&control) == 0) return;
    } else {
        blocked_[&control] = reason;
    }
    markDirty(&control);
}

void Binder::markDirty(const void* key) {
    dirty_.insert(key);
    if (!frame_.isActive()) frame_.start(kFrameMs);
}

void Binder::refreshAll() {
    for (const auto& [key, entry] : entries_) markDirty(key);
}

void Binder::flush() {
    if (flushing_) return;
    flushing_ = true;
    while (!dirty_.empty()) {
        const std::unordered_set<const void*> changed = std::move(dirty_);
        dirty_.clear();
        for (const void* key : changed)
            if (const auto found = entries_.find(key); found != entries_.end())
                found->second.show();
    }
    flushing_ = false;
}

void Binder::follow(Control& control, QObject* widget, std::function<void()> show) {
    widget->setObjectName(text(control.form().name() == "ControllerForm"
                                   ? control.name()
                                   : control.form().name() + "." + control.name()));
    if (auto* shown = qobject_cast<QWidget*>(widget); shown != nullptr) {
        show = [this, &control, shown, draw = std::move(show)] {
            describe(control, shown);
            draw();
        };
    }
    entries_[&control] = {widget, std::move(show)};
    // The windows end before the forms: a change after their end is nobody's.
    control.Changed.connect([self = QPointer<Binder>(this), key = &control] {
        if (self) self->markDirty(key);
    });
    // Not yet: the widget may have no window of its own so far.
    markDirty(&control);
}

void Binder::describe(const Control& control, QWidget* widget) {
    if (widget->property("refused").toBool()) return;  // the tip says why
    const std::string& own = control.ToolTip;
    const QString words = own.empty()                            ? toolTipOf(control)
                          : control.kind() == ControlKind::Label ? ownText(own)
                                                                 : text(own);
    const QString keys = shortcutOf(control);
    QString tip = keys.isEmpty() ? words : words + " (" + keys + ")";
    if (const QString reason = reasonFor(control); !reason.isEmpty()) tip += "\n" + reason;
    const QString name = own.empty() ? accessibleNameOf(control) : words;
    if (widget->toolTip() != tip) widget->setToolTip(tip);
    // Without a name of ours the toolkit takes that of the label beside the widget.
    if (widget->accessibleName() != name) widget->setAccessibleName(name);
}

void Binder::bind(Button& control, QPushButton* widget) {
    widget->installEventFilter(new KeyTeller(control, widget));
    connect(widget, &QPushButton::clicked, this, [this, &control] {
        note(control, "click");
        act(control, [&control] { control.Click(); });
    });
    follow(control, widget, [this, &control, widget] {
        widget->setText(caption(control, control.Caption));
        widget->setEnabled(control.Enabled && hasHandler(control) && usable(control));
        widget->setVisible(control.Visible);
        QString face = faceOf(control.BackColor);
        const std::string& picture = control.Picture;
        widget->setProperty("picture", text(picture));
        if (face == "plain" && picture.size() > 2)
            face = picture.compare(picture.size() - 2, 2, "_b") == 0 ? "blue" : "yellow";
        setFace(widget, face);
    });
}

void Binder::bind(TextBox& control, PanelLineEdit* widget) {
    widget->setControl(
        &control, [this, &control] { return refused(control); },
        [this, &control](std::function<void()> enter) {
            // As it is read: the box may have put the typed number into the panel's form.
            note(control, "set", control.Text);
            note(control, "key", "enter");
            if (!defers || !defers(control)) return false;
            act(control, std::move(enter));
            return true;
        },
        [this, &control](const char* act, const std::string& what) { note(control, act, what); });
    connect(widget, &QLineEdit::textEdited, this, [this, &control, widget](const QString& typed) {
        if (refused(control)) return markDirty(&control);
        widget->takeOver(typed.toStdString());
    });
    follow(control, widget, [this, &control, widget] {
        const QString shown = text(control.Text);
        if (widget->text() != shown) {
            const QSignalBlocker quiet(widget);
            widget->setText(shown);
            // What is only read is read from its beginning.
            if (control.Locked) widget->setCursorPosition(0);
        }
        widget->setReadOnly(control.Locked);
        widget->setEnabled(control.Enabled && usable(control));
        widget->setVisible(control.Visible);
        setFace(widget, control.Locked ? "locked" : "entry");
        setInk(widget, control.ForeColor);
    });
}

void Binder::bind(Label& control, QLabel* widget) {
    follow(control, widget, [&control, widget] {
        widget->setText(labelText(control, control.Caption));
        widget->setVisible(control.Visible);
        setInk(widget, control.ForeColor);
        setMark(widget, "struck", control.Struck);
    });
}

void Binder::bind(CheckBox& control, QCheckBox* widget) {
    connect(widget, &QCheckBox::clicked, this, [this, &control, widget] {
        note(control, "click");
        act(control, [&control] { control.Click(); });
        widget->setChecked(control.Value());
        markDirty(&control);
    });
    follow(control, widget, [this, &control, widget] {
        widget->setText(caption(control, control.Caption));
        widget->setChecked(control.Value());
        // Its value counts, with a handler or without.
        widget->setEnabled(control.Enabled && usable(control));
        widget->setVisible(control.Visible);
    });
}

void Binder::bind(OptionButton& control, QRadioButton* widget) {
    // The group is the form's: Qt's own exclusion would not know what code selects.
    widget->setAutoExclusive(false);
    connect(widget, &QRadioButton::clicked, this, [this, &control, widget] {
        note(control, "click");
        act(control, [&control] { control.Click(); });
        widget->setChecked(control.Value());
        markDirty(&control);
    });
    follow(control, widget, [this, &control, widget] {
        widget->setText(caption(control, control.Caption));
        widget->setChecked(control.Value());
        widget->setEnabled(control.Enabled && usable(control));
        widget->setVisible(control.Visible);
    });
}

void Binder::bind(DropDownList& control, QComboBox* widget) {
    widget->setEditable(control.editable());
    widget->installEventFilter(new ListGuard(control, widget));
    widget->setInsertPolicy(QComboBox::NoInsert);
    connect(widget, &QComboBox::activated, this, [this, &control](int index) {
        note(control, "choose", std::to_string(index));
        act(control, [&control, index] {
            if (!control.Locked) control.pick(index);
        });
        markDirty(&control);
    });
    if (control.editable()) {
        connect(widget, &QComboBox::editTextChanged, this, [this, &control](const QString& typed) {
            if (refused(control)) return markDirty(&control);
            note(control, "set", typed.toStdString());
            control.setText(typed.toStdString());
        });
    }
    follow(control, widget, [this, &control, widget] {
        const QSignalBlocker quiet(widget);
        QStringList items;
        for (const std::string& item : control.items()) items << ownCaption(control, item);
        bool same = items.size() == widget->count();
        for (int i = 0; same && i < items.size(); ++i) same = widget->itemText(i) == items[i];
        if (!same) {
            widget->clear();
            widget->addItems(items);
        }
        widget->setCurrentIndex(control.ListIndex());
        if (control.editable() && widget->currentText() != text(control.Text()))
            widget->setEditText(text(control.Text()));
        widget->setEnabled(control.Enabled && usable(control));
        widget->setVisible(control.Visible);
        setFace(widget, control.Locked ? "locked" : "entry");
    });
}

void Binder::bind(Slider& control, QSlider* widget) {
    connect(widget, &QSlider::valueChanged, this, [this, &control](int value) {
        if (refused(control)) return markDirty(&control);
        note(control, "choose", std::to_string(value));
        control.Value = value;
        control.Scrolled();
    });
    follow(control, widget, [&control, widget] {
        const QSignalBlocker quiet(widget);
        widget->setRange(control.Min, control.Max);
        widget->setValue(control.Value);
        widget->setEnabled(control.Enabled);
        widget->setVisible(control.Visible);
    });
}

void Binder::bind(Frame& control, QWidget* widget, QLabel* captionLabel) {
    follow(control, widget, [&control, widget, captionLabel] {
        if (captionLabel != nullptr) {
            captionLabel->setText(text(control.Caption));
            captionLabel->setVisible(control.Visible);
        }
        if (captionLabel == nullptr) widget->setVisible(control.Visible);
    });
}

void Binder::bind(MenuItem& control, QAction* action) {
    connect(action, &QAction::triggered, this, [this, &control] {
        note(control, "click");
        act(control, [&control] { control.Click(); });
        markDirty(&control);
    });
    const QString keys = shortcutOf(control);
    // A menu of the menu bar opens by its letter, an entry has keys of its own.
    const bool opens = control.parent() == nullptr;
    if (!opens) action->setShortcut(QKeySequence(keys));
    follow(control, action, [&control, action, keys, opens] {
        QString words = caption(control, control.Caption);
        if (opens && !keys.isEmpty())
            words.insert(std::max<qsizetype>(words.indexOf(keys.back(), 0, Qt::CaseInsensitive), 0),
                         '&');
        action->setText(words);
        action->setToolTip(text(control.ToolTip));
        action->setVisible(control.Visible);
        action->setEnabled(control.Enabled && (action->menu() != nullptr || hasHandler(control)));
        action->setCheckable(control.Checked);
        action->setChecked(control.Checked);
    });
}

template <class T>
void Binder::addTwin(T& control, QAction* action, std::function<void()> show) {
    connect(action, &QAction::triggered, this, [this, &control] {
        note(control, "click");
        act(control, [&control] { control.Click(); });
        markDirty(&control);
    });
    const auto found = entries_.find(&control);
    if (found == entries_.end()) return;
    found->second.show = [this, &control, action, first = std::move(found->second.show),
                          then = std::move(show)] {
        first();
        const QString reason = reasonFor(control);
        QString tip = toolTipOf(control);
        if (tip.isEmpty()) tip = text(control.Caption);
        if (const QString keys = shortcutOf(control); !keys.isEmpty()) tip += " (" + keys + ")";
        action->setToolTip(reason.isEmpty() ? tip : tip + "\n" + reason);
        action->setEnabled(control.Visible && control.Enabled && hasHandler(control) &&
                           reason.isEmpty());
        if (then) then();
    };
    markDirty(&control);
}

void Binder::twin(Button& control, QAction* action, std::function<void()> show) {
    addTwin(control, action, std::move(show));
}

void Binder::twin(MenuItem& control, QAction* action, std::function<void()> show) {
    addTwin(control, action, std::move(show));
}

void Binder::bindShow(Control& control, QWidget* widget, std::function<void()> show) {
    follow(control, widget, std::move(show));
}

void Binder::bindForm(Form& form, QObject* owner, std::function<void()> show) {
    entries_[&form] = {owner, std::move(show)};
    form.Changed.connect([self = QPointer<Binder>(this), key = &form] {
        if (self) self->markDirty(key);
    });
    markDirty(&form);
}

}  // namespace zel
