#include "welcomepage.h"

#include "icons.h"

#include <QCoreApplication>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

WelcomePage::WelcomePage(QWidget *parent) : QWidget(parent) {
    setObjectName(QStringLiteral("welcomePage"));
    setAttribute(Qt::WA_StyledBackground);
    auto *mark = new QLabel;
    mark->setAlignment(Qt::AlignCenter);
    mark->setPixmap(Icons::pixmap(QStringLiteral(":/images/logo_mark.svg"), {72, 72}, 2.0));
    auto *name = new QLabel(QCoreApplication::applicationName());
    name->setProperty("role", QStringLiteral("heading"));
    name->setAlignment(Qt::AlignCenter);
    auto *login = new QPushButton(tr("Log in"));
    login->setObjectName(QStringLiteral("welcomeLoginButton"));
    connect(login, &QPushButton::clicked, this, &WelcomePage::loginRequested);
    auto *layout = new QVBoxLayout(this);
    layout->setSpacing(16);
    layout->addStretch();
    layout->addWidget(mark);
    layout->addWidget(name);
    layout->addWidget(login, 0, Qt::AlignHCenter);
    layout->addStretch();
}
