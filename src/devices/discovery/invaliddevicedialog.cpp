#include "devices/discovery/invaliddevicedialog.h"

#include "ui_invaliddevicedialog.h"

#include <QHeaderView>

#include <algorithm>

namespace {
constexpr int cellMargins = 16;
constexpr int minColumn = 120;
constexpr int maxColumnWidth = 250;
constexpr int maxContent = 1080;
/// Margins of the dialog and a scroll bar.
constexpr int aroundTheTable = 70;
} // namespace

InvalidDeviceDialog::InvalidDeviceDialog(const QString &message, const std::vector<Entry> &entries,
                                         QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::InvalidDeviceDialog>(content())) {
    setObjectName(QStringLiteral("InvalidDeviceDialog"));
    setWindowTitle(tr("Invalid Devices"));
    m_ui->messageLabel->setText(message);
    CustomTable *table = m_ui->invalidTable;
    table->setColumnCount(2);
    table->setHorizontalHeaderLabels({tr("Device"), tr("Reason")});
    table->setRowCount(static_cast<int>(entries.size()));
    int row = 0;
    for (const Entry &entry : entries) {
        table->setItem(row, 0, new QTableWidgetItem(entry.device));
        table->setItem(row++, 1, new QTableWidgetItem(entry.reason));
    }
    fitWidth();
    m_ui->closeButton->setFocus();
    connect(m_ui->closeButton, &QPushButton::clicked, this, &QDialog::accept);
}

/// As wide as the longest reason, within what fits on a small screen; the last column takes what is left.
void InvalidDeviceDialog::fitWidth() {
    QTableWidget *table = m_ui->invalidTable;
    const QAbstractItemView &view = *table;
    table->horizontalHeader()->setStretchLastSection(true);
    table->setColumnWidth(0, std::clamp(view.sizeHintForColumn(0) + cellMargins, minColumn, maxColumnWidth));
    const int wanted = table->columnWidth(0) + view.sizeHintForColumn(1) + cellMargins + aroundTheTable;
    content()->setMinimumWidth(std::min(wanted, maxContent));
}

InvalidDeviceDialog::~InvalidDeviceDialog() = default;
