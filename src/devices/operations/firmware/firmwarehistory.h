#pragma once

#include "tasks/service/taskrecord.h"

#include <QSet>

/// What the service's tasks tell of earlier uploads of firmware.
namespace FirmwareHistory {

/// Those of the devices whose last upload failed. Any thread.
QSet<QString> lastFailed(const TaskList &tasks, const QSet<QString> &deviceIds);

} // namespace FirmwareHistory
