#include "tasks/panels/failedtaskbanner.h"

#include "tasks/queue/failedoperations.h"
#include "widgets/style/icons.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QToolButton>

FailedTaskBanner::FailedTaskBanner(QWidget *parent)
    : QFrame(parent),
      m_text(new QLabel(this)),
      m_count(new QLabel(this)),
      m_startAgain(makeButton("startAgainButton", tr("Start again"))),
      m_dismiss(makeButton("dismissFailedTaskButton", tr("Dismiss"))) {
    setObjectName(QStringLiteral("failedTaskStrip"));
    auto *icon = new QLabel(this);
    icon->setPixmap(Icons::pixmap(QStringLiteral(":/images/icon_general_warning_solid.svg"), {16, 16},
                                  devicePixelRatioF()));
    m_text->setObjectName(QStringLiteral("failedTaskLabel"));
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_count->setObjectName(QStringLiteral("failedTaskCountLabel"));
    m_count->setTextFormat(Qt::PlainText);
    m_count->setProperty("role", QStringLiteral("quiet"));
    auto *buttons = new QHBoxLayout;
    buttons->setSpacing(6);
    buttons->addWidget(m_startAgain);
    buttons->addWidget(m_dismiss);
    buttons->addStretch();
    buttons->addWidget(m_count);
    auto *layout = new QGridLayout(this);
    layout->setContentsMargins(12, 8, 12, 8);
    layout->setHorizontalSpacing(8);
    layout->setVerticalSpacing(8);
    layout->addWidget(icon, 0, 0, Qt::AlignTop);
    layout->addWidget(m_text, 0, 1);
    layout->addLayout(buttons, 1, 1);
    layout->setColumnStretch(1, 1);
    auto *operations = &FailedOperations::instance();
    connect(m_startAgain, &QToolButton::clicked, operations, &FailedOperations::startFirstAgain);
    connect(m_dismiss, &QToolButton::clicked, operations, &FailedOperations::dismissFirst);
    connect(operations, &FailedOperations::changed, this, &FailedTaskBanner::showFirst);
    showFirst();
}

QToolButton *FailedTaskBanner::makeButton(const char *name, const QString &text) {
    auto *button = new QToolButton(this);
    button->setObjectName(QLatin1String(name));
    button->setProperty("role", QStringLiteral("panel"));
    button->setText(text);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

void FailedTaskBanner::showFirst() {
    const FailedOperations &operations = FailedOperations::instance();
    const FailedOperations::Entry *first = operations.first();
    setVisible(first != nullptr);
    if (!first)
        return;
    m_text->setText(first->failure.text());
    m_startAgain->setVisible(static_cast<bool>(first->startAgain));
    m_count->setVisible(operations.count() > 1);
    m_count->setText(tr("1 of %1").arg(QLocale().toString(operations.count())));
}
