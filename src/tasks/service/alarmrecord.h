#pragma once

#include "platform/json.h"

#include <QString>

#include <memory>
#include <vector>

/// An entry of the service's alarm list, read once from its record.
struct AlarmRecord {
    /// What an alarm is about.
    enum Description {
        ServerStarted = 1,
        ConnectionLost = 2,
        ConnectionRestored = 3,
        MemoryCardError = 4,
        ServerStopped = 5,
        AuthorizationLost = 6
    };

    QString alid;
    int description = 0; ///< one of Description, or what else the service has sent
    QString subject;     ///< what it is about, mostly a device
    bool hasSubject = false;
    qint64 createdAt = 0; ///< Unix ms, 0 where there is none
    QString deviceId;
    QString deviceIp;

    /// The alarm as a sentence.
    QString text() const;

    bool operator==(const AlarmRecord &) const = default;
};

/// The service's alarms, newest first. Never changed once read, so threads share it freely.
using AlarmList = std::vector<AlarmRecord>;
using AlarmListPtr = std::shared_ptr<const AlarmList>;

namespace AlarmRecords {

/// Reads the "items" of an alarm list; throws for a value that is no array. Entries without an id are left
/// out, for nothing can be done to them; other members that are missing or of a wrong type spoil their own
/// value only.
AlarmList parse(const JSON &items);

} // namespace AlarmRecords
