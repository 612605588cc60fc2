#include "app/frame/welcomepage.h"

#include "widgets/controls/waitingspinner.h"
#include "widgets/style/icons.h"

#include <QCoreApplication>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace {

/// A part that comes and goes without moving the others.
void keepRoom(QWidget *part) {
    QSizePolicy policy = part->sizePolicy();
    policy.setRetainSizeWhenHidden(true);
    part->setSizePolicy(policy);
    part->hide();
}

} // namespace

WelcomePage::WelcomePage(QWidget *parent)
    : QWidget(parent),
      m_spinner(new WaitingSpinner),
      m_checking(new QLabel(tr("Checking the service on this computer..."))) {
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
    m_checking->setObjectName(QStringLiteral("welcomeCheckLabel"));
    m_checking->setProperty("role", QStringLiteral("quiet"));
    auto *checkLayout = new QHBoxLayout;
    checkLayout->setSpacing(8);
    checkLayout->addStretch();
    checkLayout->addWidget(m_spinner);
    checkLayout->addWidget(m_checking);
    checkLayout->addStretch();
    keepRoom(m_spinner);
    keepRoom(m_checking);
    auto *layout = new QVBoxLayout(this);
    layout->setSpacing(16);
    layout->addStretch();
    layout->addWidget(mark);
    layout->addWidget(name);
    layout->addWidget(login, 0, Qt::AlignHCenter);
    layout->addLayout(checkLayout);
    layout->addStretch();
}

void WelcomePage::setChecking(bool checking) {
    m_spinner->setVisible(checking);
    m_checking->setVisible(checking);
}
