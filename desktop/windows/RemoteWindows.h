#pragma once
// The windows of the far away instrument: the TCP dialog, the devices, the server.

#include <QSystemTrayIcon>

#include "desktop/binders/Binder.h"
#include "desktop/windows/FormWindow.h"

class QLabel;

namespace zel {

class TCPConnectionForm;
class DevicesChoiceForm;
class ServerForm;

class TcpWindow : public FormWindow {
  public:
    TcpWindow(TCPConnectionForm& form, Binder& binder, QWidget* parent);

  protected:
    bool event(QEvent* event) override;
};

class DevicesWindow : public FormWindow {
  public:
    DevicesWindow(DevicesChoiceForm& form, Binder& binder, QWidget* parent);
};

/// Settings on the left, what happens on the right. Where the desktop has a tray, the window can be
/// put away there while the server goes on.
class ServerWindow : public FormWindow {
  public:
    ServerWindow(ServerForm& form, Binder& binder, QWidget* parent);
    ~ServerWindow() override;

  private:
    QWidget* settings();
    QWidget* happenings();
    void buildTray(QPushButton* hide);
    void showLight();

    ServerForm& server_;
    QLabel* light_ = nullptr;
    QSystemTrayIcon* tray_ = nullptr;
};

}  // namespace zel
