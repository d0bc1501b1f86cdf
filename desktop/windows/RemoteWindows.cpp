#include "desktop/windows/RemoteWindows.h"

#include <QCheckBox>
#include <QComboBox>
#include <QEvent>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPainter>
#include <QPointer>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>
#include <algorithm>
#include <string>

#include "desktop/binders/Binder.h"
#include "desktop/binders/ToolTips.h"
#include "desktop/windows/FormWindow.h"
#include "forms/Forms.h"
#include "platform/Controls.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kFieldWidth = 220;
constexpr int kButtonWidth = 100;
constexpr int kLightSize = 14;  // px
constexpr int kBridging = 7;
constexpr int kListening = 2;
constexpr int kHighestPort = 65535;

PanelLineEdit* box(Binder& binder, TextBox& control) {
    auto* line = new PanelLineEdit;
    line->setMinimumWidth(kFieldWidth);
    binder.bind(control, line);
    return line;
}

QComboBox* list(Binder& binder, DropDownList& control) {
    auto* combo = new QComboBox;
    combo->setMinimumWidth(kFieldWidth);
    binder.bind(control, combo);
    return combo;
}

QPushButton* button(Binder& binder, Button& control) {
    auto* key = new QPushButton;
    key->setAutoDefault(false);
    constexpr int kAroundText = 28;  // px
    const QString text = ownCaption(control, control.Caption);
    const int wide = key->fontMetrics().horizontalAdvance(text) + kAroundText;
    key->setMinimumWidth(std::max(kButtonWidth, wide));
    binder.bind(control, key);
    return key;
}

QLabel* label(Binder& binder, Label& control) {
    auto* text = new QLabel;
    text->setWordWrap(true);
    binder.bind(control, text);
    return text;
}

QCheckBox* check(Binder& binder, CheckBox& control) {
    auto* tick = new QCheckBox;
    binder.bind(control, tick);
    return tick;
}

/// An empty field is not marked: the button says in its own words what is missing.
QString portProblem(const QString& text) {
    const bool good = text.isEmpty() || wholeNumber(text.trimmed().toStdString(), 1, kHighestPort);
    return good ? QString() : QObject::tr("The port is a whole number from 1 to 65535");
}

QPixmap lightOf(const QColor& color) {
    constexpr int kScale = 2;
    QPixmap picture(kLightSize * kScale, kLightSize * kScale);
    picture.setDevicePixelRatio(kScale);
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(color);
    painter.drawEllipse(2, 2, kLightSize - 4, kLightSize - 4);
    return picture;
}

struct Light {
    const char* meaning;
    const char* color;
};
constexpr Light kIdle{QT_TRANSLATE_NOOP("QObject", "Not serving"), "#7d8894"};
constexpr Light kSearching{QT_TRANSLATE_NOOP("QObject", "Looking for the instrument"), "#d8a32a"};
constexpr Light kWaiting{QT_TRANSLATE_NOOP("QObject", "Waiting for a client"), "#2e9e5b"};
constexpr Light kServing{QT_TRANSLATE_NOOP("QObject", "A client is at work"), "#2f80d8"};
constexpr Light kBroken{QT_TRANSLATE_NOOP("QObject", "The TCP port is in error"), "#c0392b"};

Light lightFor(const ServerForm& form) {
    if (form.ServerConnecting) return kSearching;
    if (form.ListenState > kListening) return kBroken;
    if (form.ClientState == kBridging) return kServing;
    return form.picConnected.Visible ? kWaiting : kIdle;
}

}  // namespace

TcpWindow::TcpWindow(TCPConnectionForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(12, 12, 12, 12);
    auto* fields = new QFormLayout;
    fields->addRow(QObject::tr("Recent servers"), list(binder, form.RecentServersList));
    fields->addRow(QObject::tr("Address"), box(binder, form.IPAdressTextBox));
    PanelLineEdit* port = box(binder, form.RemotePortTextBox);
    setAccept(form.ConnectTCPButton);
    checkField(*port, portProblem);
    fields->addRow(QObject::tr("Port", "of TCP"), port);
    fields->addRow("", check(binder, form.chkTls));
    PanelLineEdit* pinned = box(binder, form.FingerprintTextBox);
    pinned->setPlaceholderText(QObject::tr("of the server's certificate; empty: by its authority"));
    fields->addRow(QObject::tr("Fingerprint"), pinned);
    fields->addRow(QObject::tr("State"), box(binder, form.IDTextBox));
    QLabel* reason = label(binder, form.lblReason);
    QLabel* advice = label(binder, form.AdviceLabel);
    reason->setMinimumHeight(2 * reason->fontMetrics().height());
    for (QLabel* words : {reason, advice}) words->setAlignment(Qt::AlignTop | Qt::AlignLeft);
    layout->addLayout(fields);
    layout->addWidget(reason);
    layout->addWidget(advice);
    layout->addStretch(1);
    auto* keys = new QHBoxLayout;
    keys->addStretch(1);
    QPushButton* connectKey = button(binder, form.ConnectTCPButton);
    connectKey->setDefault(true);
    keys->addWidget(connectKey);
    keys->addWidget(button(binder, form.QuitTCPButton));
    layout->addLayout(keys);
    setCancel(form.QuitTCPButton);
    setMinimumWidth(440);
    followForm();
}

// The words of a failure differ in length; none is cut.
bool TcpWindow::event(QEvent* event) {
    const bool taken = FormWindow::event(event);
    if (event->type() != QEvent::LayoutRequest || layout() == nullptr) return taken;
    const int wanted = layout()->totalHeightForWidth(width());
    if (height() < wanted) resize(width(), wanted);
    return taken;
}

DevicesWindow::DevicesWindow(DevicesChoiceForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(12, 12, 12, 12);
    auto* fields = new QFormLayout;
    fields->addRow(QObject::tr("Device"), list(binder, form.AvailableDevicesChoice));
    fields->addRow(QObject::tr("Port"), list(binder, form.DevicesPortList));
    fields->addRow(QObject::tr("Baud rate"), list(binder, form.DevicesBaudList));
    fields->addRow(QObject::tr("Command"), label(binder, form.DeviceStatusLabel));
    layout->addLayout(fields);
    layout->addStretch(1);
    busy_ = new QProgressBar;
    busy_->setRange(0, 0);
    busy_->setTextVisible(false);
    busy_->setFixedHeight(6);
    QSizePolicy policy = busy_->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    busy_->setSizePolicy(policy);
    layout->addWidget(busy_);
    auto* keys = new QHBoxLayout;
    keys->addStretch(1);
    QPushButton* setKey = button(binder, form.SetDeviceButton);
    setKey->setDefault(true);
    keys->addWidget(setKey);
    keys->addWidget(button(binder, form.CloseDevicesButton));
    layout->addLayout(keys);
    setCancel(form.CloseDevicesButton);
    setMinimumWidth(400);
    followForm();
}

ServerWindow::ServerWindow(ServerForm& form, Binder& binder, QWidget* parent)
    : FormWindow(form, binder, parent), server_(form) {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(12, 12, 12, 12);
    layout->setSpacing(8);
    auto* columns = new QHBoxLayout;
    columns->setSpacing(8);
    columns->addWidget(settings());
    columns->addWidget(happenings(), 1);
    layout->addLayout(columns, 1);
    busy_ = new QProgressBar;
    busy_->setRange(0, 0);
    busy_->setTextVisible(false);
    busy_->setFixedHeight(6);
    QSizePolicy policy = busy_->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    busy_->setSizePolicy(policy);
    layout->addWidget(busy_);
    auto* keys = new QHBoxLayout;
    auto* hideKey = new QPushButton(QObject::tr("Hide in the tray"));
    hideKey->setAutoDefault(false);
    keys->addWidget(hideKey);
    keys->addStretch(1);
    QPushButton* connectKey = button(binder, form.cmdConnect);
    connectKey->setDefault(true);
    keys->addWidget(connectKey);
    keys->addWidget(button(binder, form.cmdCancel));
    layout->addLayout(keys);
    buildTray(hideKey);
    const auto relight = [self = QPointer<ServerWindow>(this)] {
        if (self) self->binder_.refresh(self->server_.picConnected);
    };
    form.lblState.Changed.connect(relight);
    form.Changed.connect(relight);
    // Esc asks the closing question, it does not end a connection.
    resize(820, 460);
    followForm();
}

ServerWindow::~ServerWindow() = default;

QWidget* ServerWindow::settings() {
    auto* column = new QWidget;
    auto* layout = new QVBoxLayout(column);
    layout->setContentsMargins(0, 0, 0, 0);
    auto* instrument = new QGroupBox(QObject::tr("Instrument"));
    auto* instrumentFields = new QFormLayout(instrument);
    instrumentFields->addRow(QObject::tr("Port"), list(binder_, server_.COMList));
    instrumentFields->addRow("", check(binder_, server_.chkBaudRate));
    instrumentFields->addRow(QObject::tr("Baud rate"), list(binder_, server_.BaudList));
    layout->addWidget(instrument);
    auto* network = new QGroupBox(QObject::tr("Network"));
    auto* networkFields = new QFormLayout(network);
    auto* address = new QHBoxLayout;
    PanelLineEdit* own = box(binder_, server_.localIPTextBox);
    own->setMinimumWidth(110);
    address->addWidget(own, 1);
    address->addWidget(button(binder_, server_.cmdCopyAddress));
    networkFields->addRow(QObject::tr("This machine"), address);
    PanelLineEdit* port = box(binder_, server_.localPortTextBox);
    setAccept(server_.cmdConnect);
    checkField(*port, portProblem);
    networkFields->addRow(QObject::tr("TCP port"), port);
    PanelLineEdit* allowed = box(binder_, server_.txtAllowed);
    allowed->setPlaceholderText(QObject::tr("private networks"));
    allowed->setToolTip(
        QObject::tr("Who may connect: addresses or networks such as 192.168.1.0/24, with "
                    "blanks between them. Empty: this machine and the private networks."));
    networkFields->addRow(QObject::tr("Allowed networks"), allowed);
    QCheckBox* keep = check(binder_, server_.chkKeep);
    networkFields->addRow(keep);
    layout->addWidget(network);
    layout->addStretch(1);
    return column;
}

QWidget* ServerWindow::happenings() {
    auto* group = new QGroupBox(QObject::tr("Connection"));
    auto* layout = new QVBoxLayout(group);
    auto* state = new QHBoxLayout;
    light_ = new QLabel;
    light_->setFixedWidth(kLightSize + 4);
    state->addWidget(light_);
    state->addWidget(label(binder_, server_.lblState), 1);
    layout->addLayout(state);
    binder_.bindShow(server_.picConnected, light_, [this] { showLight(); });
    auto* fields = new QFormLayout;
    auto* client = new QHBoxLayout;
    PanelLineEdit* from = box(binder_, server_.txtClientIP);
    from->setMinimumWidth(110);
    client->addWidget(from, 1);
    client->addWidget(button(binder_, server_.cmdDisconnectClient), 0, Qt::AlignRight);
    // The row keeps its place while nobody is connected.
    auto* row = new QWidget;
    row->setLayout(client);
    client->setContentsMargins(0, 0, 0, 0);
    row->setMinimumHeight(row->sizeHint().height());
    fields->addRow(label(binder_, server_.lblClient), row);
    fields->addRow(QObject::tr("To the instrument"), label(binder_, server_.lblToInstrument));
    fields->addRow(QObject::tr("To the client"), label(binder_, server_.lblToClient));
    layout->addLayout(fields);
    auto* events = new QListWidget;
    events->setFocusPolicy(Qt::ClickFocus);
    events->setSelectionMode(QAbstractItemView::NoSelection);
    events->setWordWrap(true);
    events->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    layout->addWidget(events, 1);
    binder_.bindShow(server_.lstEvents, events, [this, events] {
        events->clear();
        for (const std::string& text : server_.lstEvents.Items.get())
            events->addItem(QString::fromStdString(text));
    });
    layout->addWidget(box(binder_, server_.txtDebug));
    return group;
}

void ServerWindow::showLight() {
    const Light light = lightFor(server_);
    light_->setPixmap(lightOf(QColor(light.color)));
    light_->setToolTip(QObject::tr(light.meaning));
    if (tray_ == nullptr) return;
    tray_->setIcon(QIcon(lightOf(QColor(light.color))));
    tray_->setToolTip("ZELRemote Server: " + QObject::tr(light.meaning));
    tray_->setVisible(server_.Visible);
}

void ServerWindow::buildTray(QPushButton* hide) {
    hide->setVisible(QSystemTrayIcon::isSystemTrayAvailable());
    if (!QSystemTrayIcon::isSystemTrayAvailable()) return;
    tray_ = new QSystemTrayIcon(this);
    connect(hide, &QPushButton::clicked, this, [this] { setPutAway(true); });
    connect(tray_, &QSystemTrayIcon::activated, this, [this] { setPutAway(false); });
}

}  // namespace zel
