#include "desktop/windows/ToolStrip.h"

#include <QMenu>
#include <QPointer>
#include <QToolButton>
#include <optional>
#include <utility>

#include "desktop/binders/Binder.h"
#include "desktop/windows/MainMenus.h"
#include "desktop/windows/ThemeIcons.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"

namespace zel {
namespace {

constexpr int kIconSize = 20;
constexpr int kRoomForWords = 1430;  // pixels
const QColor kLamp(0xe0, 0x48, 0x3a);

}  // namespace

ToolStrip::ToolStrip(Forms& forms, Binder& binder, Own own, QWidget* parent)
    : QToolBar(parent), forms_(forms), binder_(binder) {
    ControllerForm& panel = forms_.controller;
    setObjectName("Toolbar");
    setWindowTitle(QObject::tr("Toolbar"));
    setAccessibleName(QObject::tr("Toolbar"));
    setMovable(false);
    setFloatable(false);
    setContextMenuPolicy(Qt::PreventContextMenu);
    setIconSize({kIconSize, kIconSize});
    setToolButtonStyle(Qt::ToolButtonTextBesideIcon);

    connect_ = add("connect", QObject::tr("Connect"));
    binder_.twin(panel.Direct, connect_);
    disconnect_ = add("disconnect", QObject::tr("Disconnect"));
    binder_.twin(panel.Disconnect, disconnect_);
    if (QToolButton* button = buttonOf(connect_); button != nullptr) {
        button->setMenu(menuOf(panel.Connection, binder_));
        button->setPopupMode(QToolButton::MenuButtonPopup);
    }
    addSeparator();
    QAction* single = add("single", QObject::tr("Single"));
    binder_.twin(panel.PlaySingleButton, single);
    QAction* run = add("continuous", QObject::tr("Continuous"));
    // What comes and goes on the panel is grey here: nothing moves.
    binder_.twin(panel.PlayContinuousButton, run, [&panel, run] {
        run->setEnabled(run->isEnabled() && panel.PlayContinuousButton.Visible);
    });
    QAction* stop = add("stop", QObject::tr("Stop"));
    buttonOf(stop)->setObjectName("StopTool");
    binder_.twin(panel.StopButton, stop,
                 [&panel, stop] { stop->setEnabled(panel.StopButton.Visible); });
    addSeparator();
    addButton(panel.cmdZoom, "zoom");
    QAction* whole = add("home", QObject::tr("Whole View"));
    whole->setToolTip(QObject::tr("The whole range of both axes (Home)"));
    QObject::connect(whole, &QAction::triggered, this, [act = own.wholeView] { act(); });
    addSeparator();
    QAction* spectrogram = add("spectrogram", QObject::tr("Spectrogram"));
    spectrogram->setCheckable(true);
    binder_.twin(panel.SpectrogramShow, spectrogram, [&panel, spectrogram] {
        spectrogram->setChecked(panel.SpectrogramPicture.Visible);
    });
    addButton(panel.cmd3D, "waterfall");
    addButton(panel.cmdSpecial, "script");
    addSeparator();
    QAction* open = add("open", QObject::tr("Open"));
    binder_.twin(panel.LoadData, open);
    QAction* save = add("save", QObject::tr("Save"));
    binder_.twin(panel.SaveCurrentView, save);
    QAction* record = add("record", QObject::tr("Record"));
    // A new icon lays the whole strip out again: not with every sweep.
    binder_.twin(panel.RecordData, record,
                 [this, &panel, record, lamp = std::optional<bool>()]() mutable {
                     // While the dialog asks nothing is recorded yet.
                     const bool runs = panel.RecordData.Checked && !forms_.time.Visible;
                     if (std::exchange(lamp, runs) == runs) return;
                     record->setIcon(runs ? themeIcon("recording", kLamp) : themeIcon("record"));
                 });
    forms_.time.Changed.connect([self = QPointer<ToolStrip>(this)] {
        if (self) self->binder_.refresh(self->forms_.controller.RecordData);
    });
    QAction* picture = add("picture", QObject::tr("Picture"));
    binder_.twin(panel.MenuFileSaveImage, picture);
    QAction* copy = add("copy", QObject::tr("Copy"));
    copy->setToolTip(QObject::tr("Copy a picture of the graph (Ctrl+C)"));
    QObject::connect(copy, &QAction::triggered, this, [act = own.copyPicture] { act(); });
    wordless_ = {single, run, stop, whole, spectrogram, open, save, record, picture, copy};
    ofTrace_ = {whole, copy};
    showConnected(false);
}

QAction* ToolStrip::add(const char* icon, const QString& text) {
    QAction* action = addAction(themeIcon(icon), text);
    if (QToolButton* button = buttonOf(action); button != nullptr) {
        button->setAccessibleName(text);
        button->setFocusPolicy(Qt::TabFocus);
    }
    return action;
}

void ToolStrip::addButton(Button& control, const char* icon) {
    auto* button = new QPushButton;
    button->setIcon(themeIcon(icon));
    button->setIconSize({kIconSize, kIconSize});
    button->setProperty("tool", true);
    binder_.bind(control, button);
    addWidget(button);
}

QToolButton* ToolStrip::buttonOf(QAction* action) const {
    return qobject_cast<QToolButton*>(widgetForAction(action));
}

void ToolStrip::showConnected(bool connected) {
    connect_->setVisible(!connected);
    disconnect_->setVisible(connected);
}

void ToolStrip::showTrace(bool there) {
    for (QAction* action : ofTrace_) action->setEnabled(there);
}

void ToolStrip::resizeEvent(QResizeEvent* event) {
    QToolBar::resizeEvent(event);
    const auto style =
        width() >= kRoomForWords ? Qt::ToolButtonTextBesideIcon : Qt::ToolButtonIconOnly;
    for (QAction* action : wordless_)
        if (QToolButton* button = buttonOf(action); button != nullptr)
            button->setToolButtonStyle(style);
}

}  // namespace zel
