#include "devices/debugexport.h"

#include "devices/zipwriter.h"
#include "http/response.h"
#include "model.h"

namespace emulator {

namespace {

/// Letters and digits of a name, for a file that every system can have.
std::string fileName(const Json &entry) {
    std::string name;
    for (const char c : entry.value("d_mac", std::string())) {
        const bool plain = (c >= '0' && c <= '9') || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F');
        name += plain ? std::string(1, c) : std::string();
    }
    return entry.at("id").get<std::string>() + (name.empty() ? "" : "_" + name) + ".txt";
}

std::string lineOf(const std::string &name, const Json &value) {
    return name + ": " + (value.is_string() ? value.get<std::string>() : jsonText(value)) + '\n';
}

/// A device that was removed since has left what the task knows of it.
std::string report(const Model &model, const Json &entry, const Task &task) {
    std::string text = "Debug information\n" + lineOf("task", task.id) + lineOf("taken_at", task.updatedAt);
    const Device *device = model.devices.find(entry.at("id"));
    const Json record = device ? Json::parse(device->body) : entry;
    for (const auto &[name, value] : record.items())
        text += lineOf(name, value);
    if (device) {
        text += lineOf("connect_status", device->reachable ? "Connected" : "Unreachable") +
                lineOf("auth_status", std::string(nameOf(device->authorization)));
    }
    return text;
}

} // namespace

std::string debugExport(const Model &model, Task &task) {
    if (task.type != "deviceExportDeviceInfo" || !isFinal(task.status))
        throw Refusal(Code::Malformed, "task " + task.id + " has exported nothing yet");
    ZipWriter zip(task.updatedAt);
    std::size_t written = 0;
    for (const Json &entry : Json::parse(task.devicesText)) {
        if (entry.at("state") == state::done) {
            zip.add(fileName(entry), report(model, entry, task));
            ++written;
        }
    }
    if (written == 0)
        throw Refusal(Code::Malformed, "no device of task " + task.id + " written anything");
    return zip.finish();
}

} // namespace emulator
