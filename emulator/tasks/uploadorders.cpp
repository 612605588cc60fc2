#include "tasks/uploadorders.h"

#include "http/answer.h"
#include "service.h"
#include "simulation/clock.h"

#include <unordered_set>

namespace emulator {

namespace {

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

} // namespace

void startUpload(Service &service, const UploadOrder &order, const UploadWork &workFor) {
    const auto recipients = service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        return recipientsOf(model, order);
    });
    std::vector<DeviceWork> works;
    for (const Recipient &recipient : recipients)
        works.push_back(workFor(recipient.device, recipient.parameters));
    service.withModel([&](Model &model) {
        Transaction transaction(model.store.database());
        model.engine.startWork(order.taskId, works, nowMs());
        log(model, order);
        transaction.commit();
    });
}

} // namespace emulator
