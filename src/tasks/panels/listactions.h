#pragma once

#include "api/session/nettask.h"

#include <QObject>
#include <QStringList>

class ServiceSession;

/// What the two panels do on the service: one job at a time, after which the list is fetched again.
class ListActions : public QObject {
    Q_OBJECT

public:
    explicit ListActions(QObject *parent = nullptr);
    ~ListActions() override;

    bool isBusy() const { return m_busy; }

    void cancelTasks(const QStringList &tids);
    void removeTasks(const QStringList &tids);
    void removeAlarms(const QStringList &alids);
    /// Removes those too that the list does not reach.
    void removeAllAlarms();

signals:
    void busyChanged(bool busy);
    /// An action failed, wholly or in part; the message says what to do.
    void failed(const QString &message);

private:
    void run(std::function<unsigned(ServiceSession &)> action, std::function<void()> reload,
             const QString &failure);

    NetTask::Owner m_runner;
    bool m_busy = false;
};
