#include "devices/page/reconnectingdialog.h"

#include "ui_reconnectingdialog.h"

#include <QAccessible>
#include <QApplication>
#include <QScreen>
#include <QWindow>

namespace {
constexpr int distanceFromOwner = 12;
} // namespace

ReconnectingDialog::ReconnectingDialog(QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::ReconnectingDialog>(content())) {
    setObjectName(QStringLiteral("ReconnectingDialog"));
    setWindowTitle(tr("Reconnecting"));
    setAttribute(Qt::WA_ShowWithoutActivating);
    setWindowFlag(Qt::WindowDoesNotAcceptFocus);
    connect(m_ui->disconnectButton, &QPushButton::clicked, this, &ReconnectingDialog::disconnectBtnClicked);
}

ReconnectingDialog::~ReconnectingDialog() = default;

void ReconnectingDialog::setStatusVisible(bool visible) {
    m_ui->statusWidget->setVisible(visible);
}

QWidget *ReconnectingDialog::wantedOwner() const {
    QWidget *modal = QApplication::activeModalWidget();
    return modal ? modal : parentWidget()->window();
}

/// The window system and the blocking by modal dialogs both go by the owner that a window has when it is
/// shown.
void ReconnectingDialog::prepareToShow() {
    m_owner = wantedOwner();
    FramelessDialog::prepareToShow();
    if (m_ownerWindow)
        m_ownerWindow->disconnect(this);
    m_ownerWindow = m_owner->windowHandle();
    // Not winId(), which would make native windows of all the widgets beside this one.
    create();
    windowHandle()->setTransientParent(m_ownerWindow);
    if (m_ownerWindow)
        connect(m_ownerWindow, &QWindow::visibleChanged, this, &ReconnectingDialog::followOwner,
                Qt::QueuedConnection);
}

void ReconnectingDialog::showEvent(QShowEvent *event) {
    FramelessDialog::showEvent(event);
    // Without the focus it would not be read out.
    QAccessibleEvent alert(this, QAccessible::Alert);
    QAccessible::updateAccessibility(&alert);
}

bool ReconnectingDialog::event(QEvent *event) {
    // A modal dialog has opened over it. Queued, since that one is only being shown.
    if (event->type() == QEvent::WindowBlocked)
        QMetaObject::invokeMethod(this, &ReconnectingDialog::followOwner, Qt::QueuedConnection);
    return FramelessDialog::event(event);
}

/// Moves to the dialog that is modal now, or back to the parent's window when there is none any more.
void ReconnectingDialog::followOwner() {
    if (!isVisible() || wantedOwner() == m_owner)
        return;
    hide();
    show();
}

/// Under the dialog that it stands on, or above where there is no room, so that it does not cover it.
QRect ReconnectingDialog::preferredPlace(const QSize &size) const {
    if (!m_owner || m_owner == parentWidget()->window())
        return FramelessDialog::preferredPlace(size);
    const QRect owner = m_owner->geometry();
    QRect place(QPoint(owner.center().x() - size.width() / 2, owner.bottom() + distanceFromOwner), size);
    if (place.bottom() > m_owner->screen()->availableGeometry().bottom())
        place.moveBottom(std::max(owner.top() - distanceFromOwner, size.height()));
    return place;
}
