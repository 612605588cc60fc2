#pragma once

#include "failedhandover.h"

#include <QFrame>
#include <QPointer>

#include <deque>

class QLabel;
class QToolButton;
class TaskQueue;

/// Tells of operations that did not begin, one after the other, each until the user starts it again or has
/// seen enough of it. Those that somebody follows are told of and begun again elsewhere. Hidden while there
/// is none.
class FailedTaskStrip : public QFrame {
    Q_OBJECT

public:
    explicit FailedTaskStrip(QWidget *parent = nullptr);

    /// Shows the failures of this queue too.
    void follow(TaskQueue *queue);

private:
    struct Entry {
        QPointer<TaskQueue> queue;
        FailedHandOver failure;
    };

    QToolButton *addButton(const char *name, const QString &text, void (TaskQueue::*answer)(const QString &));
    void showFirst();

    std::deque<Entry> m_entries;
    QLabel *m_text;
    QLabel *m_count;
};
