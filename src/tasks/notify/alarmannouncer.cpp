#include "tasks/notify/alarmannouncer.h"

#include <QCoreApplication>

#include <algorithm>

QStringList AlarmAnnouncer::follow(const AlarmList &alarms) {
    QStringList messages;
    int lost = 0;
    qint64 newest = m_lastSeen;
    for (auto alarm = alarms.rbegin(); alarm != alarms.rend(); ++alarm) {
        newest = std::max(newest, alarm->createdAt);
        if (alarm->createdAt <= m_lastSeen || !alarm->hasSubject ||
            alarm->description != AlarmRecord::ConnectionLost)
            continue;
        ++lost;
        messages += alarm->text();
    }
    m_lastSeen = newest;
    if (!std::exchange(m_started, true))
        return {};
    if (lost > maxSingle)
        return {
            QCoreApplication::translate("AlarmAnnouncer", "Lost connection to %n device(s)", nullptr, lost)};
    return messages;
}
