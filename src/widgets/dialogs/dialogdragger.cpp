#include "widgets/dialogs/dialogdragger.h"

#include <QMouseEvent>

void DialogDragger::mouseDoubleClickEvent(QMouseEvent *event) {
    event->accept();
}
