#pragma once

#include "devices/devicework.h"
#include "http/uploadedfile.h"
#include "tables/records.h"

#include <functional>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace emulator {

class Service;

/// An upload that a request hands to a task.
struct UploadOrder {
    std::string account; ///< whose request it is
    std::string taskId;
    const char *type = ""; ///< of the task
    std::span<const UploadedFile> files;
    /// The devices it is for; nothing for all that wait under the task.
    std::optional<std::vector<std::string>> deviceIds;
};

/// What an upload means for a device; its parameters are those that the request for the task gave it.
using UploadWork = std::function<DeviceWork(const Device &, const Json &parameters)>;

/// Writes the files to the log and starts the work. The work is found out without the model's lock, so it may
/// take its time. Throws Refusal for a task that is unknown, of another type, or waits for nothing.
void startUpload(Service &service, const UploadOrder &order, const UploadWork &workFor);

} // namespace emulator
