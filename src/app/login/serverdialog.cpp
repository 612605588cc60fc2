#include "app/login/serverdialog.h"

#include "app/login/serveraddress.h"
#include "ui_serverdialog.h"

ServerDialog::ServerDialog(const QString &title, const QString &applyText, QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::ServerDialog>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel) {
    setWindowTitle(title);
    m_ui->applyButton->setText(applyText);
    connect(m_ui->applyButton, &QPushButton::clicked, this, &ServerDialog::onApply);
    connect(m_ui->passEdit, &QLineEdit::textChanged, this, &ServerDialog::tellOfPassword);
    connect(m_ui->rememberCheckBox, &QCheckBox::toggled, this, &ServerDialog::tellOfPassword);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    m_ui->nameEdit->setFocus();
}

ServerDialog::~ServerDialog() = default;

void ServerDialog::fill(const QString &remember, const QString &name, const QString &info,
                        const QString &email, const QString &password) {
    m_ui->rememberCheckBox->setChecked(remember == QLatin1String("YES"));
    m_ui->nameEdit->setText(name);
    m_ui->infoEdit->setText(info);
    m_ui->emailEdit->setText(email);
    m_ui->passEdit->setText(password);
}

void ServerDialog::tellOfPassword() {
    const bool isDropped = !m_ui->passEdit->text().isEmpty() && !m_ui->rememberCheckBox->isChecked();
    m_warning.setText(isDropped ? tr("The password is kept only with “Remember Me”.") : QString());
}

void ServerDialog::onApply() {
    const QString name = m_ui->nameEdit->text().trimmed();
    const QString info = m_ui->infoEdit->text().trimmed();
    if (name.isEmpty() || info.isEmpty()) {
        m_warning.setText(tr("The field can't be empty."));
        return;
    }
    if (!ServerAddress::parse(info)) {
        m_warning.setText(
            tr("Enter an address or a name, with a port from 1 to 65535 behind a colon if need be."));
        return;
    }
    apply(m_ui->rememberCheckBox->isChecked() ? QStringLiteral("YES") : QStringLiteral("NO"), name, info,
          m_ui->emailEdit->text().trimmed(), m_ui->passEdit->text());
    accept();
}

AddServerDialog::AddServerDialog(QWidget *parent) : ServerDialog(tr("Add Server"), tr("Add"), parent) {
    setObjectName(QStringLiteral("AddServerDialog"));
}

void AddServerDialog::apply(const QString &remember, const QString &name, const QString &info,
                            const QString &email, const QString &password) {
    emit addServer(remember, name, info, email, password);
}

EditServerDialog::EditServerDialog(const QString &remember, const QString &name, const QString &info,
                                   const QString &email, const QString &password, QWidget *parent)
    : ServerDialog(tr("Edit Server"), tr("Apply"), parent) {
    setObjectName(QStringLiteral("EditServerDialog"));
    fill(remember, name, info, email, password);
}

void EditServerDialog::apply(const QString &remember, const QString &name, const QString &info,
                             const QString &email, const QString &password) {
    emit editServer(remember, name, info, email, password);
}
