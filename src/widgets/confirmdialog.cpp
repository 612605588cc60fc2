#include "confirmdialog.h"

#include "ui_confirmdialog.h"

namespace {

struct Wording {
    QString title;
    QString text;
    QString accept;
};

Wording wordingOf(ConfirmDialog::Kind kind) {
    switch (kind) {
    case ConfirmDialog::Kind::SwitchServer:
        return {ConfirmDialog::tr("Remote Connection"),
                ConfirmDialog::tr(
                    "Are you sure you want to connect to another server? The present session ends."),
                ConfirmDialog::tr("Connect")};
    }
    return {};
}

} // namespace

ConfirmDialog::ConfirmDialog(Kind kind, QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::ConfirmDialog>(content())) {
    setObjectName(QStringLiteral("ConfirmDialog"));
    const Wording wording = wordingOf(kind);
    setWindowTitle(wording.title);
    m_ui->messageLabel->setText(wording.text);
    m_ui->acceptButton->setText(wording.accept);
    connect(m_ui->acceptButton, &QPushButton::clicked, this, &QDialog::accept);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
}

ConfirmDialog::~ConfirmDialog() = default;
