#include "tasks/service/taskrecord.h"

#include "tasks/service/taskstate.h"

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {

constexpr std::size_t maxTexts = 1000;

bool isSameText(const JSON &object, const char *name, const QString &text) {
    const std::string_view member = textMember(object, name);
    return QAnyStringView(QUtf8StringView(member.data(), static_cast<qsizetype>(member.size()))) == text;
}

qint64 number(const JSON &object, const char *name) {
    const auto found = object.find(name);
    if (found == object.end())
        return 0;
    if (found->is_number_integer())
        return found->get<qint64>();
    if (found->is_number_float()) {
        const double value = found->get<double>();
        return std::abs(value) < 9e15 ? static_cast<qint64>(value) : 0;
    }
    return stringMember(object, name).toLongLong();
}

int percent(const JSON &object) {
    return static_cast<int>(std::clamp<qint64>(number(object, "progress"), 0, 100));
}

/// Progress comes as a number or a text; what counts for a comparison is how it reads.
QString progressText(const JSON &object) {
    const auto found = object.find("progress");
    if (found == object.end())
        return {};
    return found->is_string() ? stringMember(object, "progress") : QString::fromStdString(dumpJson(*found));
}

const JSON &devicesOf(const JSON &object) {
    static const JSON none = JSON::array();
    const auto found = object.find("devices");
    return found != object.end() && found->is_array() ? *found : none;
}

bool activeMember(const JSON &object, const QString &status) {
    const auto found = object.find("active");
    return found != object.end() && found->is_boolean() ? found->get<bool>() : !TaskState::isFinal(status);
}

bool isSame(const TaskDevice &device, const JSON &value) {
    return value.is_object() && isSameText(value, "state", device.state) &&
           percent(value) == device.progress && isSameText(value, "id", device.target->id) &&
           isSameText(value, "d_ip", device.target->ip) && isSameText(value, "d_mac", device.target->mac) &&
           isSameText(value, "d_model", device.target->model);
}

/// Most tasks are as they were a moment ago; to see that must cost less than to read them.
bool isSame(const TaskRecord &record, const JSON &value) {
    const JSON &devices = devicesOf(value);
    return isSameText(value, "state", record.state) && isSameText(value, "status", record.status) &&
           progressText(value) == record.progressText && number(value, "updated_at") == record.updatedAt &&
           isSameText(value, "type", record.type) && isSameText(value, "user", record.user) &&
           activeMember(value, record.status) == record.active &&
           number(value, "scheduled_at") == record.scheduledAt &&
           number(value, "created_at") == record.createdAt && devices.size() == record.devices.size() &&
           std::equal(record.devices.begin(), record.devices.end(), devices.begin(),
                      [](const TaskDevice &a, const JSON &b) { return isSame(a, b); });
}

} // namespace

bool TaskRecord::isFinal() const {
    return !active || status == TaskState::done || status == TaskState::failed ||
           status == TaskState::aborted;
}

bool TaskRecord::isFailed() const {
    return failedDevices > 0 || TaskState::isFailure(status) || TaskState::isFailure(state);
}

bool TaskRecord::hasFailedOn(const TaskDevice &device) const {
    return TaskState::isFailure(device.state) ||
           (isFinal() && status == TaskState::failed && !TaskState::isFinal(device.state));
}

TaskList::TaskList(std::vector<TaskRecordPtr> records) {
    m_records.reserve(records.size());
    m_byTid.reserve(records.size());
    for (TaskRecordPtr &record : records) {
        // A task that came in between two pages shows the last one of the first page twice.
        if (m_byTid.emplace(record->tid, m_records.size()).second)
            m_records.push_back(std::move(record));
    }
}

TaskRecordPtr TaskList::find(const QString &tid) const {
    const auto found = m_byTid.find(tid);
    return found == m_byTid.end() ? nullptr : m_records[found->second];
}

TaskRecordPtr TaskParser::parse(const JSON &value, const TaskList &previous) {
    if (!value.is_object())
        return nullptr;
    const QString tid = stringMember(value, "tid");
    if (tid.isEmpty())
        return nullptr;
    TaskRecordPtr known = previous.find(tid);
    if (known && isSame(*known, value))
        return known;
    auto record = std::make_shared<TaskRecord>();
    record->tid = tid;
    record->type = interned(textMember(value, "type"));
    record->user = interned(textMember(value, "user"));
    record->status = interned(textMember(value, "status"));
    record->state = interned(textMember(value, "state"));
    record->progressText = progressText(value);
    record->progress = percent(value);
    record->comparable = !record->state.isEmpty() && value.contains("progress");
    record->active = activeMember(value, record->status);
    record->createdAt = number(value, "created_at");
    record->updatedAt = number(value, "updated_at");
    record->scheduledAt = number(value, "scheduled_at");
    record->devices.reserve(devicesOf(value).size());
    for (const JSON &each : devicesOf(value)) {
        record->devices.push_back(device(each));
        record->failedDevices += TaskState::isFailure(record->devices.back().state);
    }
    return record;
}

TaskDevice TaskParser::device(const JSON &value) {
    if (!value.is_object())
        return {std::make_shared<TaskTarget>(), {}, 0};
    const TaskTarget read{stringMember(value, "id"), stringMember(value, "d_ip"),
                          stringMember(value, "d_mac"), stringMember(value, "d_model")};
    auto &target = m_targets[std::string(textMember(value, "id"))];
    if (!target || *target != read)
        target = std::make_shared<const TaskTarget>(read);
    return {target, interned(textMember(value, "state")), percent(value)};
}

QString TaskParser::interned(std::string_view text) {
    if (m_texts.size() > maxTexts)
        m_texts.clear();
    return *m_texts.insert(QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()))).first;
}

void TaskParser::forgetUnused() {
    std::erase_if(m_targets, [](const auto &entry) { return entry.second.use_count() == 1; });
}
