#include "desktop/windows/WaterfallWindow.h"

#include <QClipboard>
#include <QEvent>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QPainter>
#include <QPalette>
#include <QVBoxLayout>
#include <map>
#include <string>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphColors.h"
#include "desktop/graph/WaterfallCanvas.h"
#include "desktop/graph/WaterfallDrawing.h"
#include "desktop/graph/WaterfallImage.h"
#include "desktop/windows/FormWindow.h"
#include "forms/Forms.h"
#include "forms/WaterfallForm.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "waterfall/PictureOptions.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kSpacing = 8;
constexpr int kBarWidth = 84;
constexpr int kBoxWidth = 76;
constexpr QSize kSmallestPicture(800, 500);

struct Keys {
    const char* entry;
    const char* keys;
};
constexpr Keys kKeys[] = {
    {"ViewPerspective", "P"},  {"ViewOrthographic", "O"}, {"ViewWaterfall", "W"},
    {"ViewSpectrogram", "S"},  {"VewClear", "Ctrl+Del"},  {"ViewReset", "Home"},
    {"ViewFullScreen", "F11"}, {"ActionMove", "V"},       {"ActionMarkers", "M"},
    {"MarkersDelete", "Del"},  {"PictureSave", "Ctrl+S"}, {"PictureCopy", "Ctrl+C"},
};

bool isDark(const QWidget& widget) {
    return widget.palette().color(QPalette::Window).lightness() < 128;
}

/// The colours, with the level at either end.
class ColourBar : public QWidget {
  public:
    explicit ColourBar(const WaterfallForm& form) : form_(form) {
        setFixedWidth(kBarWidth);
        setMaximumHeight(420);
        setToolTip(QObject::tr("Colour by level"));
        setAccessibleName(QObject::tr("Colour by level"));
    }

  protected:
    void paintEvent(QPaintEvent*) override {
        QPainter painter(this);
        const PictureStyle style = pictureStyle(form_);
        paintColourBar(painter, rect().adjusted(0, 2, 0, -2), pictureMap(form_.Graph3D, style),
                       colourBarText(form_, style, true), colourBarText(form_, style, false),
                       isDark(*this) ? darkGraph() : lightGraph());
    }

  private:
    const WaterfallForm& form_;
};

}  // namespace

WaterfallWindow::WaterfallWindow(Forms& forms, Binder& binder, QWidget* parent)
    : FormWindow(forms.waterfall, binder, parent),
      waterfall_(forms.waterfall),
      canvas_(new WaterfallCanvas(forms.waterfall)) {
    setWindowFlag(Qt::WindowMaximizeButtonHint);
    setSizeGripEnabled(false);
    resize(960, 680);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->setMenuBar(menus());
    auto* middle = new QHBoxLayout;
    middle->setSpacing(0);
    middle->addWidget(canvas_, 1);
    middle->addWidget(colourBar());
    layout->addLayout(middle, 1);
    layout->addWidget(options());
    canvas_->setColors(isDark(*this) ? darkGraph() : lightGraph());
    binder.bindShow(waterfall_.Graph3D, canvas_, [this] {
        canvas_->setColors(isDark(*this) ? darkGraph() : lightGraph());
        canvas_->refresh();
    });
    waterfall_.DrawImage.connect(
        [self = QPointer<WaterfallWindow>(this)](const std::string& path, std::string& problem) {
            if (!self) return;
            QString error;
            saveWaterfallImage(self->waterfall_, pictureStyle(self->waterfall_),
                               QString::fromStdString(path), &error,
                               self->canvas_->size().expandedTo(kSmallestPicture), isDark(*self));
            problem = error.toStdString();
        });
    waterfall_.CopyImage.connect([self = QPointer<WaterfallWindow>(this)] {
        if (self)
            QGuiApplication::clipboard()->setImage(
                waterfallImage(self->waterfall_, pictureStyle(self->waterfall_),
                               self->canvas_->size().expandedTo(kSmallestPicture), isDark(*self)));
    });
    waterfall_.ViewFullScreen.Changed.connect([self = QPointer<WaterfallWindow>(this)] {
        if (self) self->showScreen();
    });
    canvas_->setFocus();
    followForm();
}

void WaterfallWindow::changeEvent(QEvent* event) {
    FormWindow::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        canvas_->setColors(isDark(*this) ? darkGraph() : lightGraph());
}

void WaterfallWindow::showScreen() {
    if (waterfall_.ViewFullScreen.Checked == isFullScreen() || !isVisible()) return;
    if (waterfall_.ViewFullScreen.Checked) {
        showFullScreen();
    } else {
        showNormal();
    }
}

QMenuBar* WaterfallWindow::menus() {
    auto* bar = new QMenuBar;
    std::map<const MenuItem*, QMenu*> menus;
    for (Control* control : waterfall_.controls()) {
        if (control->kind() != ControlKind::MenuItem) continue;
        auto& item = static_cast<MenuItem&>(*control);
        if (item.parent() == nullptr) {
            menus[&item] = bar->addMenu(QString());
            binder_.bind(item, menus[&item]->menuAction());
        } else if (item.Caption.get() == "-") {
            menus[item.parent()]->addSeparator();
        } else {
            QAction* action = menus[item.parent()]->addAction(QString());
            binder_.bind(item, action);
            for (const Keys& row : kKeys)
                if (item.name() == row.entry) action->setShortcut(QKeySequence(row.keys));
            action->setShortcutContext(Qt::WindowShortcut);
        }
    }
    return bar;
}

QWidget* WaterfallWindow::colourBar() {
    auto* side = new QWidget;
    auto* layout = new QVBoxLayout(side);
    layout->setContentsMargins(0, kSpacing, 0, kSpacing);
    auto* bar = new ColourBar(waterfall_);
    bar->setMinimumHeight(120);
    layout->addStretch(1);
    layout->addWidget(bar, 8);
    layout->addStretch(1);
    for (Control* control :
         {static_cast<Control*>(&waterfall_.lblMAX), static_cast<Control*>(&waterfall_.lblMin),
          static_cast<Control*>(&waterfall_.picColors)})
        binder_.bindShow(*control, bar, [bar] { bar->update(); });
    waterfall_.Graph3D.Changed.connect([shown = QPointer<ColourBar>(bar)] {
        if (shown) shown->update();
    });
    return side;
}

QWidget* WaterfallWindow::options() {
    auto* row = new QWidget;
    auto* layout = new QHBoxLayout(row);
    layout->setContentsMargins(kSpacing, kSpacing / 2, kSpacing, kSpacing / 2);
    layout->setSpacing(kSpacing / 2);
    const auto caption = [layout](const QString& text) {
        auto* label = new QLabel(text);
        label->setObjectName("caption");
        layout->addWidget(label);
        return label;
    };
    const auto list = [&](const QString& text, DropDownList& control) {
        QLabel* label = caption(text);
        auto* combo = new QComboBox;
        combo->setSizeAdjustPolicy(QComboBox::AdjustToContents);
        label->setBuddy(combo);
        layout->addWidget(combo);
        layout->addSpacing(kSpacing);
        binder_.bind(control, combo);
        combo->setAccessibleName(text);
    };
    list(QObject::tr("Colours"), waterfall_.ColourMapList);
    list(QObject::tr("Depth"), waterfall_.DepthList);
    list(QObject::tr("Levels"), waterfall_.LevelsList);
    for (TextBox* box : {&waterfall_.LevelMinBox, &waterfall_.LevelMaxBox}) {
        if (box == &waterfall_.LevelMaxBox) caption(QObject::tr("to"));
        auto* line = new PanelLineEdit;
        line->setFixedWidth(kBoxWidth);
        layout->addWidget(line);
        binder_.bind(*box, line);
    }
    layout->addStretch(1);
    auto* pointer = new QLabel;
    pointer->setMinimumWidth(240);
    pointer->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    layout->addWidget(pointer);
    binder_.bind(waterfall_.lblPointer, pointer);
    return row;
}

void WaterfallWindow::reject() {
    // Esc leaves the full screen first.
    if (waterfall_.ViewFullScreen.Checked) {
        waterfall_.ViewFullScreen.Click();
    } else {
        close();
    }
}

}  // namespace zel
