#pragma once

#include "tasks/service/alarmrecord.h"

#include <QSet>

/// Which alarms of the present service the user has seen, kept from run to run.
/// User-interface thread.
class AlarmReadHistory {
public:
    /// Turns to a service, known by its address and port, and reads what is kept for it.
    void open(const QString &service);

    bool isRead(const AlarmRecord &alarm) const { return m_read.contains(alarm.alid); }

    /// Marks all alarms of a list as read, and those that the service has beyond it.
    void markAllRead(const AlarmList &alarms);

    /// Forgets alarms that the service has no more.
    void keepOnly(const AlarmList &alarms);

    /// How many of the service's alarms, of which the list holds the newest, were not read.
    int unreadCount(const AlarmList &alarms, int total) const;

private:
    void save();

    QString m_service;
    QSet<QString> m_read;
    bool m_olderRead = false; ///< those too that are older than the list reaches
};
