#include "aboutdialog.h"

#include "icons.h"
#include "ui_aboutdialog.h"

AboutDialog::AboutDialog(QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::AboutDialog>(content())) {
    setObjectName(QStringLiteral("AboutDialog"));
    setWindowTitle(tr("About"));
    m_ui->logoLabel->setPixmap(Icons::pixmap(QStringLiteral(":/images/logo_mark.svg"), {48, 48}, 2.0));
    m_ui->nameLabel->setText(QCoreApplication::applicationName());
    m_ui->versionLabel->setText(QCoreApplication::applicationVersion());
    connect(m_ui->okButton, &QPushButton::clicked, this, &QDialog::accept);
}

AboutDialog::~AboutDialog() = default;
