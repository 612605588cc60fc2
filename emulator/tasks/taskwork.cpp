#include "tasks/taskwork.h"

#include "http/dispatcher.h"
#include "http/response.h"
#include "model.h"
#include "service.h"
#include "simulation/clock.h"

#include <map>
#include <string>
#include <unordered_set>

namespace emulator {

namespace {

DeviceWork workOn(const Model &model, const std::string &id, const WorkOf &workOf) {
    const Device *device = model.devices.find(id);
    DeviceWork work = device ? workOf(*device) : DeviceWork();
    work.id = id;
    return work;
}

void checkType(const Model &model, const std::string &taskId, std::string_view type) {
    if (!type.empty() && model.tasks.get(taskId).type != type)
        throw Refusal(Code::Malformed, "the task is for something else");
}

constexpr std::size_t maxNameLength = 255;

struct Recipient {
    Device device;
    Json parameters;
};

/// Devices that were removed have failed under their task already.
std::vector<Recipient> recipientsOf(const Model &model, const UploadOrder &order) {
    const Task &task = model.tasks.get(order.taskId);
    if (task.type != order.type)
        throw Refusal(Code::Malformed, "the task is for something else");
    std::optional<std::unordered_set<std::string>> wanted;
    if (order.deviceIds)
        wanted.emplace(order.deviceIds->begin(), order.deviceIds->end());
    std::vector<Recipient> recipients;
    for (const TaskDevice &entry : task.devices) {
        const bool waits = entry.phase == TaskDevice::Phase::WithoutWork;
        const Device *device = model.devices.find(entry.id);
        if (waits && device && (!wanted || wanted->contains(entry.id)))
            recipients.push_back({*device, entry.parameters});
    }
    if (recipients.empty())
        throw Refusal(Code::Malformed, "no device waits for this under the task");
    return recipients;
}

void log(Model &model, const UploadOrder &order) {
    for (const UploadedFile &file : order.files) {
        model.log.add(nowMs(), "System", "Audit",
                      "Received \"" + file.name.substr(0, maxNameLength) + "\" for task " + order.taskId +
                          ", " + std::to_string(file.size) + " bytes, SHA-256 " + file.sha256,
                      order.account);
    }
}

/// Empty where the parameters name none; errors in them are reported when the whole form has arrived.
std::string taskIdOf(const Request &incoming) {
    try {
        const Json parameters = parseJson(incoming.body);
        return parameters.is_object() ? optionalText(parameters, "tid") : std::string();
    } catch (const Refusal &) {
        return {};
    }
}

} // namespace

std::vector<Target> targetsOf(const Json &body, const char *name) {
    std::vector<Target> targets;
    for (const Json &element : arrayMember(body, name))
        if (element.is_string())
            targets.push_back({element.get<std::string>(), {}});
        else if (element.is_object())
            targets.push_back({textMember(element, "id"), optionalText(element, "tid")});
        else
            throw Refusal(Code::Malformed, std::string("an element of \"") + name + "\" names no device");
    return targets;
}

std::vector<std::string> idsOf(const std::vector<Target> &targets) {
    std::vector<std::string> ids;
    for (const Target &target : targets)
        ids.push_back(target.id);
    return ids;
}

void checkKnown(const Model &model, const std::vector<Target> &targets) {
    for (const Target &target : targets)
        model.devices.get(target.id);
}

void startUnderTasks(Model &model, const std::vector<Target> &targets, std::string_view type,
                     const WorkOf &workOf) {
    std::map<std::string, std::vector<DeviceWork>> works;
    for (const Target &target : targets)
        if (!target.taskId.empty())
            works[target.taskId].push_back(workOn(model, target.id, workOf));
    for (const auto &[taskId, work] : works) {
        checkType(model, taskId, type);
        model.engine.judgeWork(taskId, work);
    }
    for (const auto &[taskId, work] : works)
        model.engine.startWork(taskId, work, nowMs());
}

Outcome doAtOnce(Model &model, Device &device, const DeviceWork &work) {
    if (!device.reachable)
        return Outcome::NoConnection;
    if (!isPermitted(device, work.access))
        return Outcome::NotAuthorized;
    if (!work.failure.empty())
        return Outcome::Failed;
    apply(model.devices, device, work);
    return Outcome::Done;
}

void doAtOnce(Model &model, const std::vector<Target> &targets, const WorkOf &workOf) {
    Transaction transaction(model.store.database());
    for (const Target &target : targets) {
        if (target.taskId.empty()) {
            Device &device = model.devices.get(target.id);
            doAtOnce(model, device, workOf(device));
        }
    }
    transaction.commit();
}

void order(Service &service, const std::vector<Target> &targets, std::string_view type,
           const WorkOf &workOf) {
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        checkKnownWithoutTask(model, targets);
        startUnderTasks(model, targets, type, workOf);
        doAtOnce(model, targets, workOf);
    });
}

void checkKnownWithoutTask(const Model &model, const std::vector<Target> &targets) {
    for (const Target &target : targets)
        if (target.taskId.empty())
            model.devices.get(target.id);
}

void startUpload(Service &service, const UploadOrder &order, const UploadWork &workOf) {
    const auto recipients = service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        return recipientsOf(model, order);
    });
    std::vector<DeviceWork> works;
    for (const Recipient &recipient : recipients)
        works.push_back(workOf(recipient.device, recipient.parameters));
    service.withModel([&](Model &model) {
        Transaction transaction(model.store.database());
        model.engine.startWork(order.taskId, works, nowMs());
        log(model, order);
        transaction.commit();
    });
}

WorkArrival::WorkArrival(Service &service, const Request &incoming)
    : m_service(service), m_taskId(taskIdOf(incoming)) {
    m_service.withModel([&](Model &model) {
        if (!model.sessions.find(incoming.authorization, nowMs()))
            m_taskId.clear();
        else if (!m_taskId.empty())
            model.engine.beginArrival(m_taskId);
    });
}

WorkArrival::~WorkArrival() {
    if (!m_taskId.empty())
        m_service.withModel([this](Model &model) { model.engine.endArrival(m_taskId); });
}

} // namespace emulator
