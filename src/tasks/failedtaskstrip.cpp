#include "failedtaskstrip.h"

#include "icons.h"
#include "taskinfopool.h"
#include "taskqueue.h"
#include "tasktype.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QToolButton>

FailedTaskStrip::FailedTaskStrip(QWidget *parent)
    : QFrame(parent), m_text(new QLabel(this)), m_count(new QLabel(this)) {
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
    buttons->addWidget(addButton("startAgainButton", tr("Start again"), &TaskQueue::startAgain));
    buttons->addWidget(addButton("dismissFailedTaskButton", tr("Dismiss"), &TaskQueue::dismiss));
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
    connect(&CTaskInfoPool::instance(), &CTaskInfoPool::cleared, this, [this] {
        m_entries.clear();
        showFirst();
    });
    showFirst();
}

QToolButton *FailedTaskStrip::addButton(const char *name, const QString &text,
                                        void (TaskQueue::*answer)(const QString &)) {
    auto *button = new QToolButton(this);
    button->setObjectName(QLatin1String(name));
    button->setProperty("role", QStringLiteral("panel"));
    button->setText(text);
    button->setFocusPolicy(Qt::TabFocus);
    connect(button, &QToolButton::clicked, this, [this, answer] {
        if (m_entries.empty())
            return;
        const Entry answered = m_entries.front();
        m_entries.pop_front();
        showFirst();
        if (answered.queue)
            (answered.queue->*answer)(answered.failure.ctid);
    });
    return button;
}

void FailedTaskStrip::follow(TaskQueue *queue) {
    connect(queue, &TaskQueue::handOverFailed, this, [this, queue](const FailedHandOver &failure) {
        if (failure.isFollowed)
            return;
        m_entries.push_back({queue, failure});
        showFirst();
    });
}

void FailedTaskStrip::showFirst() {
    setVisible(!m_entries.empty());
    if (m_entries.empty())
        return;
    const FailedHandOver &failure = m_entries.front().failure;
    m_text->setText(tr("%1 on %n device(s) did not begin. %2", nullptr, failure.devices)
                        .arg(TaskType::title(failure.serviceType), failure.reason));
    m_count->setVisible(m_entries.size() > 1);
    m_count->setText(tr("1 of %1").arg(QLocale().toString(static_cast<int>(m_entries.size()))));
}
