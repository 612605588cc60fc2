#include "reconnectingdialog.h"

#include "ui_reconnectingdialog.h"

ReconnectingDialog::ReconnectingDialog(QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::ReconnectingDialog>(content())) {
    setObjectName(QStringLiteral("ReconnectingDialog"));
    setWindowTitle(tr("Reconnecting"));
    connect(m_ui->disconnectButton, &QPushButton::clicked, this, &ReconnectingDialog::disconnectBtnClicked);
}

ReconnectingDialog::~ReconnectingDialog() = default;

void ReconnectingDialog::setStatusVisible(bool visible) {
    m_ui->statusWidget->setVisible(visible);
}
