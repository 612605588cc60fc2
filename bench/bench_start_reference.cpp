// The least that a window of Qt costs.

#include "firstframe.h"

#include <QApplication>

int main(int argc, char *argv[]) {
    QApplication application(argc, argv);
    QWidget window;
    window.resize(1280, 720);
    new FirstFrame(window);
    window.show();
    return QApplication::exec();
}
