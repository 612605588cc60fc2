#include "refreshdevicedialog.h"

#include "ui_refreshdevicedialog.h"

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

void RefreshDeviceDialog::showEvent(QShowEvent *event) {
    FramelessDialog::showEvent(event);
    if (std::exchange(m_asked, true))
        return;
    emit refresh();
}
