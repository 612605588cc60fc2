#include "pages/settings/settingschangeddialog.h"

#include "pages/settings/serversettings.h"

#include <QFrame>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace {

constexpr int dialogWidth = 560;

QLabel *addCell(QGridLayout *grid, int row, int column, const QString &text, const char *role) {
    auto *label = new QLabel(text);
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    label->setProperty("role", QLatin1String(role));
    grid->addWidget(label, row, column, Qt::AlignTop);
    return label;
}

} // namespace

SettingsChangedDialog::SettingsChangedDialog(const QStringList &keys, const QVariantMap &page,
                                             const QVariantMap &server, QWidget *parent)
    : FramelessDialog(parent) {
    setObjectName(QStringLiteral("SettingsChangedDialog"));
    setWindowTitle(tr("Settings Changed Meanwhile"));
    content()->setMinimumWidth(dialogWidth);
    auto *text = new QLabel(tr("Somebody else has changed these settings since you opened the page. Nothing "
                               "is saved yet."));
    text->setObjectName(QStringLiteral("messageLabel"));
    text->setWordWrap(true);
    auto *layout = new QVBoxLayout(content());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    auto *body = new QVBoxLayout;
    body->setContentsMargins(20, 18, 20, 16);
    body->setSpacing(14);
    body->addWidget(text);
    body->addWidget(buildList(keys, page, server));
    layout->addLayout(body);
    layout->addWidget(buildFooter());
}

QWidget *SettingsChangedDialog::buildList(const QStringList &keys, const QVariantMap &page,
                                          const QVariantMap &server) {
    auto *list = new QWidget;
    list->setObjectName(QStringLiteral("changesList"));
    auto *grid = new QGridLayout(list);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(16);
    grid->setVerticalSpacing(8);
    grid->setColumnStretch(0, 2);
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    addCell(grid, 0, 0, tr("Setting"), "quiet");
    addCell(grid, 0, 1, tr("This page"), "quiet");
    addCell(grid, 0, 2, tr("Server now"), "quiet");
    for (int row = 1; row <= keys.size(); ++row) {
        const QString &key = keys[row - 1];
        addCell(grid, row, 0, ServerSettings::name(key), "title");
        addCell(grid, row, 1, ServerSettings::valueText(page.value(key)), "caption");
        addCell(grid, row, 2, ServerSettings::valueText(server.value(key)), "caption");
    }
    return list;
}

QWidget *SettingsChangedDialog::buildFooter() {
    auto *footer = new QFrame;
    footer->setObjectName(QStringLiteral("dialogFooter"));
    auto *cancel = new QPushButton(tr("Cancel"));
    cancel->setObjectName(QStringLiteral("cancelButton"));
    auto *page = new QPushButton(tr("Save this page's values"));
    page->setObjectName(QStringLiteral("keepPageButton"));
    auto *server = new QPushButton(tr("Keep the server's values"));
    server->setObjectName(QStringLiteral("keepServerButton"));
    cancel->setAutoDefault(false);
    page->setAutoDefault(false);
    // What nobody loses anything by.
    server->setDefault(true);
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(20, 14, 20, 14);
    layout->setSpacing(10);
    layout->addStretch();
    for (QPushButton *button : {cancel, page, server})
        layout->addWidget(button);
    connect(cancel, &QPushButton::clicked, this, &QDialog::reject);
    connect(page, &QPushButton::clicked, this, [this] {
        accept();
        emit keepPageValues();
    });
    connect(server, &QPushButton::clicked, this, [this] {
        accept();
        emit keepServerValues();
    });
    return footer;
}
