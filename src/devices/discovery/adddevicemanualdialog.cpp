#include "devices/discovery/adddevicemanualdialog.h"

#include "devices/inventory/devicerecord.h"
#include "ui_adddevicemanualdialog.h"

#include <QDebug>
#include <QLocale>
#include <QRegularExpressionValidator>

AddDeviceManualDialog::AddDeviceManualDialog(QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::AddDeviceManualDialog>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel) {
    setObjectName(QStringLiteral("AddDeviceManualDialog"));
    setWindowTitle(tr("Add Device Manually"));
    m_ui->portEdit->setValidator(
        new QRegularExpressionValidator(QRegularExpression(QStringLiteral("[0-9]{0,5}")), this));
    for (const QLineEdit *edit : content()->findChildren<QLineEdit *>())
        connect(edit, &QLineEdit::textChanged, this, &AddDeviceManualDialog::onTextChanged);
    connect(m_ui->manualTabs, &QTabWidget::currentChanged, this, &AddDeviceManualDialog::onTextChanged);
    connect(m_ui->addButton, &QPushButton::clicked, this, &AddDeviceManualDialog::onAdd);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    m_ui->manualTabs->setCurrentIndex(0);
    m_ui->addressEdit->setFocus();
}

AddDeviceManualDialog::~AddDeviceManualDialog() = default;

std::optional<qint64> AddDeviceManualDialog::rangeSize(const QString &from, const QString &to) {
    const quint64 first = DeviceRecords::ipSortKey(from);
    const quint64 last = DeviceRecords::ipSortKey(to);
    if (first == DeviceRecord::unknownKey || last == DeviceRecord::unknownKey)
        return std::nullopt;
    return static_cast<qint64>(last) - static_cast<qint64>(first) + 1;
}

bool AddDeviceManualDialog::isRangeShown() const {
    return m_ui->manualTabs->currentWidget() == m_ui->rangeTab;
}

QString AddDeviceManualDialog::complaint() const {
    if (!isRangeShown()) {
        const QString port = m_ui->portEdit->text();
        if (!port.isEmpty() && (port.toInt() < 1 || port.toInt() > 65535))
            return tr("The port must be a number from 1 to 65535.");
        return {};
    }
    const std::optional<qint64> size = rangeSize(m_ui->fromEdit->address(), m_ui->toEdit->address());
    if (size && *size < 1)
        return tr("The range ends before it begins.");
    if (size && *size > maxRangeSize)
        return tr("The range has %1 addresses; %2 are the most that can be searched at once.")
            .arg(QLocale().toString(*size), QLocale().toString(maxRangeSize));
    return {};
}

void AddDeviceManualDialog::onTextChanged() {
    const std::optional<qint64> size = rangeSize(m_ui->fromEdit->address(), m_ui->toEdit->address());
    m_ui->rangeLabel->setText(!size || *size < 1 ? QString()
                              : *size == 1       ? tr("1 address")
                                                 : tr("%1 addresses").arg(QLocale().toString(*size)));
    m_warning.setText(complaint());
}

void AddDeviceManualDialog::onAdd() {
    const QList<IPLineEdit *> fields = isRangeShown() ? QList<IPLineEdit *>{m_ui->fromEdit, m_ui->toEdit}
                                                      : QList<IPLineEdit *>{m_ui->addressEdit};
    for (IPLineEdit *field : fields) {
        if (field->isValid())
            continue;
        m_warning.setText(field->text().isEmpty()
                              ? tr("The field can't be empty.")
                              : tr("An address has four numbers from 0 to 255, as in 192.168.0.10."));
        return field->setFocus();
    }
    m_warning.setText(complaint());
    if (!complaint().isEmpty())
        return;
    if (isRangeShown())
        addRange();
    else
        addAddress();
    accept();
}

void AddDeviceManualDialog::addAddress() {
    const QString ip = m_ui->addressEdit->address();
    const int port = m_ui->portEdit->text().toInt();
    qDebug("manual add from ip: %s, port: %d", qUtf8Printable(ip), port);
    emit discoveryRequested(DeviceDiscovery::Method::Address,
                            port > 0 ? ip + QLatin1Char(':') + QString::number(port) : ip, {});
}

void AddDeviceManualDialog::addRange() {
    const QString from = m_ui->fromEdit->address();
    const QString to = m_ui->toEdit->address();
    qDebug("maunal add from ip range %s to %s", qUtf8Printable(from), qUtf8Printable(to));
    emit discoveryRequested(DeviceDiscovery::Method::Range, from, to);
}
