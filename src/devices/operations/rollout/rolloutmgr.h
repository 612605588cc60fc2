#pragma once

#include "devices/operations/rollout/rolloutrecords.h"

#include <QObject>
#include <QTimer>

#include <memory>

/// The rollouts of the session. They outlive the dialog that has begun them and end when the user logs off.
/// When the program is closed, or the service ends the session, they come back as soon as the same account
/// logs in to the same server.
/// User-interface thread.
class RolloutMgr : public QObject {
    Q_OBJECT

public:
    static RolloutMgr &instance();

    void start(RolloutPlan plan);

    /// In the order in which they were begun.
    std::vector<Rollout *> rollouts() const;
    /// True while one of them has something to do by itself: a log-off would end it.
    bool isBusy() const;
    /// Forgets a rollout; a wave that is at work goes on.
    void dismiss(Rollout *rollout);

signals:
    /// There are others, or one of them stands elsewhere.
    void changed();
    /// The session has ended before its rollouts have; the message tells of them.
    void dropped(const QString &message);

private:
    RolloutMgr();

    Rollout *add(RolloutPlanPtr plan);
    static void upload(Rollout &rollout, const QStringList &deviceIds, const QString &actionTime);
    static void insert(Rollout &rollout, const JSON &deviceIds, const QString &actionTime);
    void advanceAll();
    void onTaskListUpdated();
    void onSessionEnded();
    void beginSession();
    void restore();
    void keep();

    std::vector<std::unique_ptr<Rollout>> m_rollouts;
    QTimer m_timer;
    quint64 m_generation = 0; ///< of the session that the rollouts belong to, 0 before the first one
    QString m_session;        ///< the word that they are kept under
    bool m_restored = false;
};
