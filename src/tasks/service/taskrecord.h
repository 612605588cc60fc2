#pragma once

#include "platform/json.h"

#include <QHash>
#include <QString>

#include <memory>
#include <unordered_map>
#include <unordered_set>
#include <vector>

/// What a task is done to. The same one is shared by all tasks of the device.
struct TaskTarget {
    QString id;
    QString ip;
    QString mac;
    QString model;

    bool operator==(const TaskTarget &) const = default;
};

/// How far a task is on one device.
struct TaskDevice {
    std::shared_ptr<const TaskTarget> target;
    QString state;
    int progress = 0; ///< percent
};

/// A task of the service, read once from its record. Never changed after that, so threads share it freely.
struct TaskRecord {
    QString tid;
    QString type;
    QString user;
    QString status;
    QString state;
    QString progressText; ///< as it is compared from poll to poll
    int progress = 0;     ///< percent
    bool active = false;
    bool comparable = false; ///< the record has a state and a progress
    qint64 createdAt = 0;    ///< Unix ms, 0 where there is none; so the two below
    qint64 updatedAt = 0;
    qint64 scheduledAt = 0;
    std::vector<TaskDevice> devices;
    int failedDevices = 0;

    /// True when nothing more happens to it.
    bool isFinal() const;
    /// True where something of it has failed.
    bool isFailed() const;
    /// True where it has failed on one of its devices: as a whole it may fail before it has come to some.
    bool hasFailedOn(const TaskDevice &device) const;
};

/// A task may be missing from a list for once, when others were removed while it was read page by page: it is
/// gone when so many in a row lack it.
inline constexpr int listsWithoutAGoneTask = 3;

using TaskRecordPtr = std::shared_ptr<const TaskRecord>;

/// The tasks of one reading, newest first. Built once on any thread, never changed after that.
class TaskList {
public:
    TaskList() = default;
    /// Of records with the same id the first one counts.
    explicit TaskList(std::vector<TaskRecordPtr> records);

    const std::vector<TaskRecordPtr> &records() const { return m_records; }
    bool isEmpty() const { return m_records.empty(); }
    /// Null where there is none.
    TaskRecordPtr find(const QString &tid) const;

private:
    std::vector<TaskRecordPtr> m_records;
    std::unordered_map<QString, std::size_t> m_byTid;
};

using TaskListPtr = std::shared_ptr<const TaskList>;

/// Reads task records. It remembers texts and targets that it has met, for tasks name the same devices and
/// states over and over. Used by one thread at a time.
class TaskParser {
public:
    /// The record of a value; the previous one itself when it says the same. Null for a value that is no
    /// object or has no id. Members that are missing or of a wrong type spoil their own value only.
    TaskRecordPtr parse(const JSON &value, const TaskList &previous);

    /// Forgets what no record uses any more.
    void forgetUnused();

private:
    TaskDevice device(const JSON &value);
    QString interned(std::string_view text);

    std::unordered_map<std::string, std::shared_ptr<const TaskTarget>> m_targets;
    std::unordered_set<QString> m_texts;
};
