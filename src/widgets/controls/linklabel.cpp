#include "widgets/controls/linklabel.h"

#include <QFocusEvent>

void LinkLabel::focusInEvent(QFocusEvent *event) {
    QLabel::focusInEvent(event);
    if (event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason)
        focusNextPrevChild(event->reason() == Qt::TabFocusReason);
}
