#pragma once

#include "devices/devicework.h"
#include "http/jsonaccess.h"
#include "http/uploadedfile.h"
#include "tables/records.h"

#include <functional>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace emulator {

class Service;
struct Request;
struct Model;

/// A device that a request names, and the task under which the work on it runs; empty for none.
struct Target {
    std::string id;
    std::string taskId;
};

/// The elements of an argument that names devices: ids or objects with "id" and, perhaps, "tid".
std::vector<Target> targetsOf(const Json &body, const char *name = "devices");
std::vector<std::string> idsOf(const std::vector<Target> &targets);
/// Throws Refusal(UnknownId) when one is no managed device.
void checkKnown(const Model &model, const std::vector<Target> &targets);

/// What a request wants of a device.
using WorkOf = std::function<DeviceWork(const Device &)>;

/// Starts the work of the targets that name a task, under these tasks. All of it is judged before any of it
/// starts: throws Refusal when a target is unknown to its task, or a task is of another type than the given
/// one; empty stands for any.
void startUnderTasks(Model &model, const std::vector<Target> &targets, std::string_view type,
                     const WorkOf &workOf);

/// What came of work without a task.
enum class Outcome { Done, NoConnection, NotAuthorized, Failed };

/// Does a work at once.
Outcome doAtOnce(Model &model, Device &device, const DeviceWork &work);
/// Does what the targets without a task are to do, on those that can.
void doAtOnce(Model &model, const std::vector<Target> &targets, const WorkOf &workOf);

/// Has work done: under the tasks of the targets, at once where they name none.
void order(Service &service, const std::vector<Target> &targets, std::string_view type, const WorkOf &workOf);

/// Throws Refusal(UnknownId) when a target without a task is no managed device; those under a task fail
/// there.
void checkKnownWithoutTask(const Model &model, const std::vector<Target> &targets);

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
void startUpload(Service &service, const UploadOrder &order, const UploadWork &workOf);

/// While it lives, the task that a form names waits for its work, however long the files take.
class WorkArrival {
public:
    /// The form's parameters are there. Nothing comes of a form without a session or a task.
    WorkArrival(Service &service, const Request &incoming);
    ~WorkArrival();
    WorkArrival(const WorkArrival &) = delete;
    WorkArrival &operator=(const WorkArrival &) = delete;

private:
    Service &m_service;
    std::string m_taskId;
};

} // namespace emulator
