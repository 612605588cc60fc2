#pragma once

#include "tasks/service/alarmrecord.h"

#include <QStringList>

/// Decides which alarms are worth a message on the desktop: devices that were lost since the list before.
class AlarmAnnouncer {
public:
    /// More lost devices than this come as one message.
    static constexpr int maxSingle = 3;

    /// The messages for a list, the oldest alarm's first. The first list announces nothing.
    QStringList follow(const AlarmList &alarms);

    /// The next list is a first one again.
    void reset() { *this = {}; }

private:
    bool m_started = false;
    qint64 m_lastSeen = 0; ///< creation time of the newest alarm that was seen
};
