#include "devices/page/refreshdevicedialog.h"

#include "ui_refreshdevicedialog.h"

#include <QApplication>

RefreshDeviceDialog::RefreshDeviceDialog(QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::RefreshDeviceDialog>(content())) {
    setObjectName(QStringLiteral("RefreshDeviceDialog"));
    setWindowTitle(tr("Refresh"));
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
}

RefreshDeviceDialog::~RefreshDeviceDialog() = default;

void RefreshDeviceDialog::finish() {
    emit refreshDone();
    accept();
}

void RefreshDeviceDialog::setVisible(bool visible) {
    if (visible && isHidden())
        m_activeBefore = QApplication::activeWindow();
    const bool hadKeyboard = !visible && isActiveWindow();
    FramelessDialog::setVisible(visible);
    if (!hadKeyboard)
        return;
    // Window managers like to hand it to the main window, also where a dialog blocks that one.
    QWidget *next = QApplication::activeModalWidget();
    if (!next)
        next = m_activeBefore;
    if (next && next->isVisible())
        next->activateWindow();
}

void RefreshDeviceDialog::showEvent(QShowEvent *event) {
    FramelessDialog::showEvent(event);
    if (std::exchange(m_asked, true))
        return;
    emit refresh();
}
