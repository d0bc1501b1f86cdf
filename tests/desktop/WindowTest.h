#pragma once
// The panel's window over a simulated instrument, in virtual time and without a screen.

#include <gtest/gtest.h>

#include <QApplication>
#include <memory>

#include "ZELSim/InProcessPort.h"
#include "desktop/windows/MainWindow.h"
#include "desktop/windows/Theme.h"
#include "platform/virtual/VirtualPlatform.h"
#include "shell/Program.h"

namespace zel {

/// The one application of the test program.
QApplication& testApplication();

/// A picture beside the test's program, to be looked at.
bool savePicture(QWidget& widget, const QString& name);

class WindowTest : public testing::Test {
  protected:
    WindowTest();
    ~WindowTest() override;

    void connect();
    ControllerForm& panel() { return program->forms().controller; }
    template <class Widget>
    Widget* widgetOf(const Control& control) {
        window->binder().flush();
        return qobject_cast<Widget*>(window->binder().widgetOf(control));
    }
    /// Shows the window and brings widgets and forms into step.
    void show();

    VirtualPlatform platform;
    zelsim::InProcessPort port{platform.clock, platform.events};
    std::unique_ptr<Program> program;
    std::unique_ptr<MainWindow> window;
};

}  // namespace zel
