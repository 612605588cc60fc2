// The frame as a window: its states, its buttons, the edges that resize it, and what
// it sees of all input.

#include "app/frame/framelesswindow.h"

#include "app/frame/idlewatch.h"
#include "app/frame/resizeedges.h"
#include "app/frame/titlebar.h"
#include "widgets/dialogs/framelessdialog.h"

#include <QKeyEvent>
#include <QLayout>
#include <QMouseEvent>
#include <QTimer>
#include <QWindow>

void FramelessWindow::setWindowTitle(const QString &title) {
    QWidget::setWindowTitle(title);
}

void FramelessWindow::setWindowIcon(const QIcon &icon) {
    QWidget::setWindowIcon(icon);
}

void FramelessWindow::topWindow() {
    setWindowState(windowState() & ~Qt::WindowMinimized);
    show();
    raise();
    activateWindow();
}

void FramelessWindow::on_applicationStateChanged(Qt::ApplicationState state) {
    // A dialog of a minimised program may come back below its window.
    if (state == Qt::ApplicationActive && m_dialog)
        m_dialog->raise();
}

void FramelessWindow::on_minimizeButton_clicked() {
    setWindowState((windowState() & ~Qt::WindowFullScreen) | Qt::WindowMinimized);
}

void FramelessWindow::on_maximizeButton_clicked() {
    setWindowState(Qt::WindowMaximized);
}

void FramelessWindow::on_restoreButton_clicked() {
    setWindowState(Qt::WindowNoState);
}

void FramelessWindow::on_closeButton_clicked() {
    close();
}

void FramelessWindow::on_windowTitlebar_doubleClicked() {
    if (isMaximized())
        on_restoreButton_clicked();
    else
        on_maximizeButton_clicked();
}

void FramelessWindow::changeEvent(QEvent *event) {
    QWidget::changeEvent(event);
    if (event->type() != QEvent::WindowStateChange)
        return;
    const int margin = isMaximized() || isFullScreen() ? 0 : ResizeEdges::margin;
    layout()->setContentsMargins(margin, margin, margin, margin);
    m_titleBar->setMaximized(isMaximized());
    if (m_dialog)
        QTimer::singleShot(0, m_dialog, &FramelessDialog::centreOverParent);
}

Qt::Edges FramelessWindow::edgesAt(const QPoint &position) const {
    return isMaximized() || isFullScreen() ? Qt::Edges() : ResizeEdges::at(position, size());
}

void FramelessWindow::mousePressEvent(QMouseEvent *event) {
    const Qt::Edges edges = edgesAt(event->position().toPoint());
    if (event->button() == Qt::LeftButton && edges && windowHandle())
        windowHandle()->startSystemResize(edges);
}

void FramelessWindow::mouseMoveEvent(QMouseEvent *event) {
    setCursor(ResizeEdges::cursorOf(edgesAt(event->position().toPoint())));
}

bool FramelessWindow::eventFilter(QObject *watched, QEvent *event) {
    if (event->type() == QEvent::MouseButtonPress && m_loggedIn)
        m_idle->noteActivity();
    // The key goes to windows first, which know less about the place than the widget with the focus.
    if (event->type() == QEvent::KeyPress && watched->isWidgetType() &&
        static_cast<QKeyEvent *>(event)->matches(QKeySequence::HelpContents)) {
        openGuide(static_cast<QWidget *>(watched));
        return true;
    }
    return QWidget::eventFilter(watched, event);
}
