#include "desktop/windows/ReconnectBar.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPointer>
#include <QPushButton>

#include "desktop/binders/Binder.h"
#include "desktop/binders/ToolTips.h"
#include "forms/ControllerForm.h"
#include "platform/Controls.h"

namespace zel {

ReconnectBar::ReconnectBar(ControllerForm& panel, Binder& binder, QWidget* parent)
    : QFrame(parent) {
    setObjectName("group");
    setAccessibleName(QObject::tr("Lost connection"));
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(12, 4, 8, 4);
    layout->setSpacing(8);
    auto* text = new QLabel;
    text->setWordWrap(true);
    text->setTextFormat(Qt::PlainText);
    binder.bind(panel.ReconnectLabel, text);
    layout->addWidget(text, 1);
    auto* always = new QCheckBox(ownCaption(panel.ReconnectAlways, panel.ReconnectAlways.Caption));
    always->setToolTip(QObject::tr(
        "Connects again as soon as the port or the server is back and the instrument answers"));
    always->setChecked(panel.ReconnectAlways.Checked);
    connect(always, &QCheckBox::clicked, this, [&panel, &binder] {
        if (binder.tell) binder.tell("click", panel.ReconnectAlways.name());
        panel.ReconnectAlways.Click();
    });
    panel.ReconnectAlways.Changed.connect([tick = QPointer<QCheckBox>(always), &panel] {
        if (tick) tick->setChecked(panel.ReconnectAlways.Checked);
    });
    layout->addWidget(always);
    const auto key = [&](Button& control) {
        auto* button = new QPushButton;
        button->setMinimumWidth(90);
        binder.bind(control, button);
        layout->addWidget(button);
        return button;
    };
    key(panel.ReconnectButton)->setProperty("face", "blue");
    key(panel.ReconnectCloseButton);
    binder.bind(panel.ReconnectFrame, this, nullptr);
    setVisible(panel.ReconnectFrame.Visible);
}

}  // namespace zel
