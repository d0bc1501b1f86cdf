#include "tests/desktop/WindowTest.h"

#include <QDir>

#include "desktop/windows/GuardedApplication.h"

namespace zel {

QApplication& testApplication() {
    static int count = 1;
    static char name[] = "test_desktop";
    static char* arguments[] = {name, nullptr};
    // Left standing: the toolkit's own statics end first.
    static auto* application = [] {
        // The same fonts on every desk.
        qputenv("FONTCONFIG_FILE", ZEL_SOURCE_DIR "/tests/fonts.conf");
        return new GuardedApplication(count, arguments);
    }();
    return *application;
}

bool savePicture(QWidget& widget, const QString& name) {
    const QString beside = QApplication::applicationDirPath() + "/pictures";
    const QString folder = qEnvironmentVariable("ZEL_PICTURES", beside);
    return QDir().mkpath(folder) && widget.grab().save(folder + "/" + name + ".png");
}

WindowTest::WindowTest() {
    applyTheme(testApplication(), ThemeChoice::Dark);
    program = std::make_unique<Program>(platform.bundle(port), "");
    program->start();
    window = std::make_unique<MainWindow>(*program);
    window->buildAll();
}

WindowTest::~WindowTest() { window.reset(); }

void WindowTest::connect() {
    ASSERT_TRUE(program->connect({LinkAddress::Kind::Serial, "/dev/zel3", 57600}, true));
}

void WindowTest::show() {
    window->show();
    window->showNow();
    QApplication::processEvents();
}

}  // namespace zel
