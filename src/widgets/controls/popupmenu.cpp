#include "widgets/controls/popupmenu.h"

PopupMenu::PopupMenu(QWidget *parent) : QMenu(parent) {
    setWindowFlag(Qt::NoDropShadowWindowHint);
    setToolTipsVisible(true);
}
