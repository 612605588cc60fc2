#include "invaliddevicedialog.h"

#include "ui_invaliddevicedialog.h"

InvalidDeviceDialog::InvalidDeviceDialog(const QString &message, const std::vector<Entry> &entries,
                                         QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::InvalidDeviceDialog>(content())) {
    setObjectName(QStringLiteral("InvalidDeviceDialog"));
    setWindowTitle(tr("Invalid Devices"));
    m_ui->messageLabel->setText(message);
    CustomTable *table = m_ui->invalidTable;
    table->setColumnCount(2);
    table->setHorizontalHeaderLabels({tr("Device"), tr("Reason")});
    table->setColumnWidth(0, 250);
    table->setRowCount(static_cast<int>(entries.size()));
    int row = 0;
    for (const Entry &entry : entries) {
        table->setItem(row, 0, new QTableWidgetItem(entry.device));
        table->setItem(row++, 1, new QTableWidgetItem(entry.reason));
    }
    m_ui->closeButton->setFocus();
    connect(m_ui->closeButton, &QPushButton::clicked, this, &QDialog::accept);
}

InvalidDeviceDialog::~InvalidDeviceDialog() = default;
