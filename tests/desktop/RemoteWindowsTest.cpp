#include <QComboBox>
#include <QLabel>
#include <QLayout>
#include <QListWidget>
#include <QPushButton>

#include "server/ServerBridge.h"
#include "tests/desktop/WindowTest.h"

namespace zel {
namespace {

constexpr QSize kSmallScreen(1024, 600);

struct RemoteWindowsTest : WindowTest {
    MainForm& dial = program->forms().main;
    TCPConnectionForm& tcp = program->forms().tcpConnection;
    DevicesChoiceForm& devices = program->forms().devicesChoice;
    ServerForm& server = program->forms().server;

    void SetUp() override {
        platform.ports.ports = {"/dev/ttyUSB0", "/dev/ttyS0"};
        platform.serverSocket.setLocalIP("192.168.1.7");
        show();
    }
    /// Runs `look` while the modal form that `open` shows stands.
    template <class Open, class Look>
    void whileShown(const Open& open, Form& form, const Look& look) {
        platform.events.schedule(1, [&] {
            window->binder().flush();
            QApplication::processEvents();
            look();
            form.Hide();
        });
        open();
    }
    QWidget* windowOf(const Control& control) { return widgetOf<QWidget>(control)->window(); }
    void bothThemes(const Control& control, const QString& name) {
        QWidget* widget = windowOf(control);
        ASSERT_NE(widget, nullptr);
        for (const auto& [theme, word] :
             {std::pair{ThemeChoice::Light, "light"}, {ThemeChoice::Dark, "dark"}}) {
            applyTheme(testApplication(), theme);
            QApplication::processEvents();
            EXPECT_TRUE(savePicture(*widget, name + "_" + word));
        }
        applyTheme(testApplication(), ThemeChoice::Light);
        EXPECT_LE(widget->minimumSizeHint().width(), kSmallScreen.width());
        EXPECT_LE(widget->minimumSizeHint().height(), kSmallScreen.height());
    }
};

TEST_F(RemoteWindowsTest, Dialling_HasNumberKeysAndSpeed) {
    whileShown([this] { panel().Modem.Click(); }, dial,
               [this] {
                   dial.TelNumberBox.Text = "+44 1632 960123";
                   dial.AirBaudRateText.Text = " CONNECT 19200 ";
                   for (const Control* control : std::initializer_list<const Control*>{
                            &dial.TelNumberBox, &dial.DialButton, &dial.AirBaudRateText}) {
                       ASSERT_NE(widgetOf<QWidget>(*control), nullptr) << control->name();
                       EXPECT_TRUE(widgetOf<QWidget>(*control)->isVisible()) << control->name();
                   }
                   bothThemes(dial.TelNumberBox, "dialling");
               });
}

TEST_F(RemoteWindowsTest, Tcp_StatusLineSaysThatItConnectsAndFocusIsInTheAddress) {
    const auto says = [this](const char* text) {
        for (const QLabel* label : window->findChildren<QLabel*>())
            if (label->text() == text && label->isVisible()) return true;
        return false;
    };
    whileShown([this] { panel().TCPConnection.Click(); }, tcp,
               [&] {
                   QWidget* dialog = windowOf(tcp.IPAdressTextBox);
                   EXPECT_EQ(dialog->focusWidget(), widgetOf<QWidget>(tcp.IPAdressTextBox));
                   EXPECT_TRUE(says("Not connected"));
                   tcp.Connecting = true;
                   tcp.AdviceLabel.Caption = "Connecting to 192.168.1.20:2277";
                   EXPECT_TRUE(says("Connecting..."));
                   tcp.Connecting = false;
                   tcp.AdviceLabel.Caption = "";
                   EXPECT_TRUE(says("Not connected"));
               });
}

TEST_F(RemoteWindowsTest, SerialPort_DialogIsAsHighAsItsPageNeeds) {
    whileShown([this] { panel().Direct.Click(); }, dial,
               [this] {
                   QApplication::processEvents();
                   QWidget* dialog = windowOf(dial.COMList);
                   QLayout& page = *dialog->layout();
                   const int wanted = page.hasHeightForWidth()
                                          ? page.totalHeightForWidth(dialog->width())
                                          : page.totalSizeHint().height();
                   EXPECT_EQ(dialog->height(), wanted);
                   EXPECT_LT(dialog->height(), 280);
               });
}

TEST_F(RemoteWindowsTest, Tcp_ShowsWhyThereIsNoConnection) {
    whileShown(
        [this] { panel().TCPConnection.Click(); }, tcp,
        [this] {
            tcp.IPAdressTextBox.Text = "192.168.1.20";
            tcp.RemotePortTextBox.Text = "2277";
            tcp.IDTextBox.Text = "TCP Socket Error.";
            tcp.lblReason.Caption =
                "The server's certificate is of no authority that this computer knows. Give its "
                "fingerprint, or the authority's file in ZELREMOTE_TLS_CA.";
            tcp.AdviceLabel.Caption =
                "192.168.1.20:2277: check that the server runs there, that its instrument is on "
                "and "
                "connected, and that no firewall is between";
            window->binder().flush();
            for (const Label* label : {&tcp.lblReason, &tcp.AdviceLabel}) {
                auto* shown = widgetOf<QLabel>(*label);
                ASSERT_NE(shown, nullptr) << label->name();
                EXPECT_TRUE(shown->isVisible());
                // The words are whole.
                QApplication::processEvents();
                EXPECT_GE(shown->height(), shown->heightForWidth(shown->width()));
            }
            bothThemes(tcp.lblReason, "tcp");
        });
}

TEST_F(RemoteWindowsTest, Devices_ListsNamesAndPorts) {
    platform.folder.folder = "/app";
    platform.files.put("/app/settings.ini", "[DEVICES]\nINIT1=Hayes modem\nINIT2=GSM terminal\n");
    whileShown([this] { panel().SetDevice.Click(); }, devices,
               [this] {
                   auto* names = widgetOf<QComboBox>(devices.AvailableDevicesChoice);
                   ASSERT_NE(names, nullptr);
                   EXPECT_EQ(names->count(), 2);
                   devices.DeviceStatusLabel.Caption = "AT+CBST=7,0,1";
                   window->binder().flush();
                   bothThemes(devices.AvailableDevicesChoice, "devices");
               });
}

TEST_F(RemoteWindowsTest, Server_ShowsStateClientTrafficAndEvents) {
    whileShown([this] { panel().UtilityServer.Click(); }, server,
               [this] {
                   bothThemes(server.cmdConnect, "server_idle");
                   server.chkBaudRate.setValue(false);
                   server.BaudList.setListIndex(3);
                   server.cmdConnect.Click();
                   ASSERT_TRUE(program->server().bridging());
                   platform.serverSocket.knock(1, "192.168.1.20");
                   platform.serverSocket.knock(2, "8.8.8.8");
                   platform.events.runFor(1100);
                   window->binder().flush();
                   QApplication::processEvents();
                   EXPECT_EQ(widgetOf<QLabel>(server.lblState)->text(), "A client is connected");
                   auto* end = widgetOf<QPushButton>(server.cmdDisconnectClient);
                   EXPECT_TRUE(end->isEnabled());
                   EXPECT_GT(end->width(), end->fontMetrics().horizontalAdvance(end->text()));
                   EXPECT_TRUE(widgetOf<QWidget>(server.txtClientIP)->isVisible());
                   auto* events = widgetOf<QListWidget>(server.lstEvents);
                   ASSERT_EQ(events->count(), 4);
                   EXPECT_TRUE(events->item(0)->text().endsWith("refused 8.8.8.8"));
                   server.cmdCopyAddress.Click();
                   EXPECT_EQ(platform.clipboard.text(), "192.168.1.7:2277");
                   bothThemes(server.cmdConnect, "server_client");
                   program->server().disconnect();
               });
}

}  // namespace
}  // namespace zel
