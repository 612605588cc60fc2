#include "tables/tasktable.h"

#include "http/response.h"
#include "simulation/random.h"
#include "tables/records.h"
#include "tables/store.h"

#include <algorithm>
#include <iterator>
#include <sstream>
#include <utility>

namespace emulator {

namespace {

const std::string &devicesText(Task &task) {
    if (task.devicesText.empty()) {
        task.devicesText = "[";
        for (const TaskDevice &device : task.devices)
            appendEntry(task.devicesText, device.identity, device.state, device.progress);
        task.devicesText += ']';
    }
    return task.devicesText;
}

/// What the next run of the program needs to do the work.
std::string workText(const Task &task) {
    Json all = Json::array();
    for (const TaskDevice &device : task.devices) {
        all.push_back({{"parameters", device.parameters},
                       {"there", device.phase != TaskDevice::Phase::WithoutWork},
                       {"ended", device.phase == TaskDevice::Phase::Ended},
                       {"work", toJson(device.work)}});
    }
    return jsonText(all);
}

TaskDevice::Phase phaseOf(const Json &kept) {
    using Phase = TaskDevice::Phase;
    // Work that ran when the program ended starts again.
    return kept.value("ended", false) ? Phase::Ended : kept.at("there") ? Phase::Queued : Phase::WithoutWork;
}

std::vector<TaskDevice> devicesOf(const std::string &entries, const std::string &works) {
    std::vector<TaskDevice> devices;
    const Json work = Json::parse(works);
    for (const Json &entry : Json::parse(entries)) {
        const Json &its = work.at(devices.size());
        TaskDevice device;
        device.id = entry.at("id");
        device.identity = identityText(device.id, entry);
        device.state = entry.at("state");
        device.progress = entry.at("progress");
        device.phase = phaseOf(its);
        device.parameters = its.at("parameters");
        device.work = deviceWorkOf(its.value("work", Json::object()));
        devices.push_back(std::move(device));
    }
    return devices;
}

/// The record of a task but for its devices.
std::string headText(const Task &task) {
    return jsonText({{"tid", task.id},
                     {"type", task.type},
                     {"action", task.type},
                     {"user", task.user},
                     {"status", task.status},
                     {"state", task.state},
                     {"progress", task.progress},
                     {"active", !isFinal(task.status)},
                     {"created_at", task.createdAt},
                     {"updated_at", task.updatedAt},
                     {"scheduled_at", task.scheduledAt}});
}

Task taskOf(const Json &head) {
    Task task;
    task.id = head.at("tid");
    task.type = head.at("type");
    task.user = head.at("user");
    task.status = head.at("status");
    task.state = head.at("state");
    task.progress = head.at("progress");
    task.createdAt = head.at("created_at");
    task.updatedAt = head.at("updated_at");
    task.scheduledAt = head.at("scheduled_at");
    return task;
}

std::vector<std::string> wordsOf(const char *text) {
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

} // namespace

bool isFinal(const std::string &state) {
    return state == state::done || state == state::failed || state == state::aborted;
}

std::string identityText(const Device &device) {
    return identityText(device.id, Json::parse(device.body));
}

std::string identityText(const std::string &id, const Json &record) {
    std::string text = R"({"id":)" + jsonText(id);
    for (const char *name : {"d_ip", "d_mac", "d_model"}) {
        const auto found = record.find(name);
        const bool isText = found != record.end() && found->is_string();
        text += std::string(",\"") + name + "\":" + (isText ? jsonText(*found) : R"("")");
    }
    return text;
}

void appendEntry(std::string &text, const std::string &identity, const std::string &state, int progress) {
    text += text.size() > 1 ? "," : "";
    text += identity;
    text += R"(,"state":")";
    text += state;
    text += R"(","progress":)" + std::to_string(progress) + '}';
}

TaskTable::TaskTable(Store &store)
    : m_store(store),
      m_save(store.database(), "INSERT OR REPLACE INTO task VALUES(?,?,?,?)"),
      m_remove(store.database(), "DELETE FROM task WHERE row=?"),
      m_lastRow(store.lastRow("task")) {
    Statement rows(store.database(), "SELECT row,head,devices,work FROM task ORDER BY row");
    while (rows.step()) {
        m_tasks.push_back(std::make_unique<Task>(taskOf(Json::parse(rows.text(1)))));
        Task &task = *m_tasks.back();
        task.row = rows.integer(0);
        task.devicesText = rows.text(2);
        if (!isFinal(task.status))
            task.devices = devicesOf(task.devicesText, rows.text(3));
        m_byId[task.id] = &task;
    }
}

Task *TaskTable::find(const std::string &id) const {
    const auto found = m_byId.find(id);
    return found == m_byId.end() ? nullptr : found->second;
}

Task &TaskTable::get(const std::string &id) const {
    Task *task = find(id);
    if (!task)
        throw Refusal(Code::UnknownId, "no task " + id);
    return *task;
}

std::vector<Task *> TaskTable::open() const {
    std::vector<Task *> open;
    for (const auto &task : m_tasks)
        if (!isFinal(task->status))
            open.push_back(task.get());
    return open;
}

Task &TaskTable::add(Task task) {
    task.row = ++m_lastRow;
    task.id = "TK" + std::to_string(task.row);
    m_tasks.push_back(std::make_unique<Task>(std::move(task)));
    m_byId[m_tasks.back()->id] = m_tasks.back().get();
    save(*m_tasks.back());
    return *m_tasks.back();
}

void TaskTable::save(Task &task) {
    const bool isOver = isFinal(task.status);
    const std::string work = isOver ? std::string() : workText(task);
    m_save.bind(task.row).bind(headText(task)).bind(devicesText(task)).bind(work).run();
    if (isOver) {
        task.devices = {};
        task.running = {};
    }
}

void TaskTable::remove(const std::unordered_set<std::string> &ids) {
    Transaction transaction(m_store.database());
    for (const std::string &id : ids)
        m_remove.bind(get(id).row).run();
    transaction.commit();
    for (const std::string &id : ids)
        m_byId.erase(id);
    std::erase_if(m_tasks, [&](const std::unique_ptr<Task> &task) { return ids.contains(task->id); });
}

std::string TaskTable::text(Task &task) {
    std::string text = headText(task);
    text.pop_back();
    return text + R"(,"devices":)" + devicesText(task) + '}';
}

std::string TaskTable::pageText(Page page) const {
    const std::size_t first = std::min(page.start, m_tasks.size());
    const std::size_t last = first + std::min(page.count, m_tasks.size() - first);
    std::string all = "[";
    for (std::size_t i = first; i < last; ++i) {
        all += i == first ? "" : ",";
        all += text(**(m_tasks.rbegin() + static_cast<std::ptrdiff_t>(i)));
    }
    return all + ']';
}

std::size_t TaskTable::touch(std::size_t count) {
    const std::size_t touched = std::min(count, m_tasks.size());
    for (std::size_t i = 0; i < touched; ++i) {
        Task &task = *m_tasks[m_tasks.size() - 1 - i];
        task.progress = (task.progress + 1) % 101;
    }
    return touched;
}

const std::vector<std::string> &taskTypes() {
    static const auto types =
        wordsOf("deviceConfigFileUpload deviceFWUpgrade deviceGenSelfSignedCert deviceHttpsCertInstall "
                "deviceHttpsCertsAndPKeys deviceIEEE_EAP_PEAP deviceIEEE_EAP_TLS devicePackageUpload "
                "deviceAssignIPAuto deviceAssignIPManual deviceExportDeviceInfo deviceQuickSetup "
                "deviceRestart deviceRestore deviceChangePass devicePassPolicy deviceCreateTemplate "
                "deviceSetTemplate deviceCustomCommand");
    return types;
}

std::string failureCode(Random &random) {
    // Those that end in an underscore go on with the number of a slot.
    static const auto codes = wordsOf(
        "pTaskMismatchingStatus pTaskUnsupportedMethod pTaskMismatchingPrivateKeyAndCertificate "
        "pTaskInvalidFileOrPublicKey pTaskCertificateNotInstalled pTaskNotInstalled "
        "pTaskDeviceResponseTimeout pTaskDeviceResponseTimeoutEx pTaskFailedToConnectToDevice "
        "pTaskFailedToConnectToDeviceEx pTaskFailedToSetPassword pTaskInvalidFileForThisModelGroup "
        "pTaskIncompatibleFirmware pTaskNoSdCardDetected pTaskSdCardError_ pTaskMaxPackageUploadLimit_ "
        "pTaskInsufficientStorage_ pTaskBrokenFile_ pInternalProcessError_");
    const std::string &code = codes[random.below(codes.size())];
    const std::uint64_t slot = 1 + random.below(16);
    return code.ends_with('_') ? code + (slot < 10 ? "0" : "") + std::to_string(slot) : code;
}

} // namespace emulator
