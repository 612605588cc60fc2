#pragma once

#include "tasks/service/taskrecord.h"

#include <QStringList>

/// What the panel says of tasks and of their devices, as plain text.
namespace TaskTexts {

/// "3 of 24 failed: 2 Failed to connect to device, 1 Broken or invalid file", the commonest cause first; how
/// many are in which state where none has failed.
QString summary(const TaskRecord &task);

/// A task in a line: how many devices, and its state or the time that it waits for; what has failed in one
/// that is over.
QString standing(const TaskRecord &task);
/// True while it is at work, and its progress tells something.
bool showsProgress(const TaskRecord &task);
/// "40 %"
QString percent(int progress);
/// What a row shows in several places, as one text; empty parts are left out.
QString spoken(QStringList parts);

/// "Started by admin at 2026/11/21 14:02", and the scheduled time with its time zone.
QString origin(const TaskRecord &task);

/// A time of today as "14:02", an earlier one with its date; empty for 0.
QString shortTime(qint64 unixMs);
/// "2026/11/22 02:00 (UTC+1)"
QString zonedTime(qint64 unixMs);

/// "NC-4210 · 10.4.0.11 · 00:1A:07:10:04:0B"
QString target(const TaskTarget &target);

/// A device as a line of a copied table: model, IP, MAC, state, progress, with tabs between.
QString copyLine(const TaskDevice &device);
/// A task with all its devices, failed ones first.
QString copyText(const TaskRecord &task);

/// The places of a task's devices, failed ones first and then those at work.
std::vector<int> order(const TaskRecord &task);

} // namespace TaskTexts
