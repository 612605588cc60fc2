#include "widgets/dialogs/windowdragger.h"

#include <QApplication>
#include <QMouseEvent>
#include <QWindow>

WindowDragger::WindowDragger(QWidget *parent) : QWidget(parent) {
    // A plain widget subclass paints its style sheet's background only when told so.
    setAttribute(Qt::WA_StyledBackground);
}

void WindowDragger::mousePressEvent(QMouseEvent *event) {
    m_pressed = event->button() == Qt::LeftButton;
    m_pressedAt = event->position().toPoint();
}

void WindowDragger::mouseMoveEvent(QMouseEvent *event) {
    const int moved = (event->position().toPoint() - m_pressedAt).manhattanLength();
    if (!m_pressed || moved < QApplication::startDragDistance())
        return;
    // The window system takes the pointer from here on; no release will come.
    m_pressed = false;
    emit dragged();
    if (QWindow *handle = window()->windowHandle())
        handle->startSystemMove();
}

void WindowDragger::mouseDoubleClickEvent(QMouseEvent *event) {
    m_pressed = false;
    if (event->button() == Qt::LeftButton)
        emit doubleClicked();
}
