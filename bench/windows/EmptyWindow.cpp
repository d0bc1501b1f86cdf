// The least that a Qt program can show: an empty window. Prints a line when it has been painted.

#include <QApplication>
#include <cstdio>

#include "bench/windows/FirstPaint.h"

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    QWidget window;
    const zelbench::FirstPaint watch(window, [] {
        std::puts("painted");
        std::fflush(stdout);
        QApplication::exit();
    });
    window.resize(1024, 600);
    window.show();
    return QApplication::exec();
}
