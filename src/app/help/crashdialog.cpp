#include "app/help/crashdialog.h"

#include <QDesktopServices>
#include <QFile>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QUrl>
#include <QVBoxLayout>

namespace {

constexpr QSize textSize{720, 340};
constexpr qint64 maxBytes = 256 * 1024;

QString beginOf(const QString &path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.read(maxBytes)) : QString();
}

} // namespace

CrashDialog::CrashDialog(const QString &path, QWidget *parent) : FramelessDialog(parent) {
    setObjectName(QStringLiteral("CrashDialog"));
    setWindowTitle(tr("Unexpected End"));
    auto *layout = new QVBoxLayout(content());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(buildBody(path), 1);
    layout->addWidget(buildFooter(path));
}

QWidget *CrashDialog::buildBody(const QString &path) {
    auto *body = new QWidget(content());
    auto *message =
        new QLabel(tr("The program ended unexpectedly the last time. This report was saved; it may "
                      "help your support to find out why. Passwords are left out of it."),
                   body);
    message->setObjectName(QStringLiteral("messageLabel"));
    message->setTextFormat(Qt::PlainText);
    message->setWordWrap(true);
    auto *text = new QPlainTextEdit(beginOf(path), body);
    text->setObjectName(QStringLiteral("reportEdit"));
    text->setAccessibleName(tr("Report"));
    text->setReadOnly(true);
    text->setLineWrapMode(QPlainTextEdit::NoWrap);
    text->setMinimumSize(textSize);
    text->setTabChangesFocus(true);
    auto *layout = new QVBoxLayout(body);
    layout->setContentsMargins(20, 18, 20, 16);
    layout->setSpacing(12);
    layout->addWidget(message);
    layout->addWidget(text, 1);
    return body;
}

QWidget *CrashDialog::buildFooter(const QString &path) {
    auto *footer = new QFrame(content());
    footer->setObjectName(QStringLiteral("dialogFooter"));
    auto *folder = new QPushButton(tr("Show folder"), footer);
    folder->setObjectName(QStringLiteral("showFolderButton"));
    folder->setAutoDefault(false);
    auto *dismiss = new QPushButton(tr("Dismiss"), footer);
    dismiss->setObjectName(QStringLiteral("dismissButton"));
    dismiss->setDefault(true);
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(20, 14, 20, 14);
    layout->setSpacing(10);
    layout->addStretch();
    layout->addWidget(folder);
    layout->addWidget(dismiss);
    connect(folder, &QPushButton::clicked, this,
            [path] { QDesktopServices::openUrl(QUrl::fromLocalFile(QFileInfo(path).absolutePath())); });
    connect(dismiss, &QPushButton::clicked, this, &QDialog::accept);
    return footer;
}
