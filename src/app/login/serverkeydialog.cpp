#include "app/login/serverkeydialog.h"

#include "ui_serverkeydialog.h"

#include <QLocale>

namespace {

/// In two lines of the same groups, so that two fingerprints can be compared.
QString inTwoLines(const std::string &fingerprint) {
    const std::string::size_type half = fingerprint.size() / 2;
    return ServerKeys::readable(fingerprint.substr(0, half)) + u'\n' +
           ServerKeys::readable(fingerprint.substr(half));
}

QString timeText(const QDateTime &time) {
    return QLocale().toString(time.toLocalTime(), QLocale::ShortFormat);
}

} // namespace

QString ServerKeyDialog::localKeyChangedText() {
    return tr("The service on this computer shows another key than before, so nothing was sent to it.");
}

ServerKeyDialog::ServerKeyDialog(const QString &server, const ServerKey &remembered, const QString &newKey,
                                 QWidget *parent)
    : FramelessDialog(parent), m_ui(formIn<Ui::ServerKeyDialog>(content())) {
    setObjectName(QStringLiteral("ServerKeyDialog"));
    setWindowTitle(tr("Server Key Changed"));
    m_ui->messageLabel->setText(
        server == ServerKeys::thisComputer
            ? tr("The service on this computer shows another key than before. Nothing is sent to it.")
            : tr("The server %1 shows another key than before. Nothing is sent to it.").arg(server));
    m_ui->rememberedKeyLabel->setText(inTwoLines(remembered.fingerprint));
    m_ui->rememberedTimeLabel->setText(
        tr("First seen %1, last seen %2").arg(timeText(remembered.firstSeen), timeText(remembered.lastSeen)));
    m_ui->rememberedTimeLabel->setVisible(remembered.firstSeen.isValid());
    m_ui->newKeyLabel->setText(inTwoLines(newKey.toStdString()));
    m_ui->newTimeLabel->setText(tr("First seen %1").arg(timeText(QDateTime::currentDateTime())));
    connect(m_ui->trustButton, &QPushButton::clicked, this, &QDialog::accept);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    m_ui->cancelButton->setFocus();
}

ServerKeyDialog::~ServerKeyDialog() = default;
