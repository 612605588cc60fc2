#include "tasks/service/alarmrecord.h"

#include <QCoreApplication>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <stdexcept>

namespace {

int integer(const JSON &object, const char *name) {
    const auto found = object.find(name);
    if (found == object.end() || !found->is_number_integer())
        return 0;
    return static_cast<int>(std::clamp<qint64>(found->get<qint64>(), -1, 1 << 30));
}

const char *pattern(int description) {
    switch (description) {
    case AlarmRecord::ServerStarted:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Server started");
    case AlarmRecord::ConnectionLost:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Lost connection to %1");
    case AlarmRecord::ConnectionRestored:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Connection to %1 restored");
    case AlarmRecord::MemoryCardError:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Memory card error on %1");
    case AlarmRecord::ServerStopped:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Server stopped");
    case AlarmRecord::AuthorizationLost:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Authorization of %1 lost");
    default:
        return QT_TRANSLATE_NOOP("AlarmRecord", "Alarm: %1");
    }
}

} // namespace

QString AlarmRecord::text() const {
    const QString sentence = QCoreApplication::translate("AlarmRecord", pattern(description));
    // Without a subject that tells anything, the address is the next best name.
    return sentence.contains(QLatin1String("%1")) ? sentence.arg(subject.isEmpty() ? deviceIp : subject)
                                                  : sentence;
}

namespace AlarmRecords {

AlarmList parse(const JSON &items) {
    if (!items.is_array())
        throw std::runtime_error("items is no array");
    AlarmList list;
    list.reserve(items.size());
    for (const JSON &item : items) {
        AlarmRecord alarm;
        alarm.alid = stringMember(item, "alid");
        if (alarm.alid.isEmpty())
            continue;
        alarm.description = integer(item, "despid");
        alarm.subject = stringMember(item, "actinfo");
        alarm.hasSubject = item.contains("actinfo") && item.at("actinfo").is_string();
        alarm.createdAt = stringMember(item, "initm").toLongLong();
        alarm.deviceId = stringMember(item, "deviceid");
        alarm.deviceIp = stringMember(item, "d_ip");
        list.push_back(std::move(alarm));
    }
    return list;
}

} // namespace AlarmRecords
