#pragma once

#include <string>

namespace emulator {

struct IncomingRequest;
class Service;

/// While it lives, the task that a form names waits for its work, however long the files take.
class WorkArrival {
public:
    /// The form's parameters are there. Nothing comes of a form without a session or a task.
    WorkArrival(Service &service, const IncomingRequest &incoming);
    ~WorkArrival();
    WorkArrival(const WorkArrival &) = delete;
    WorkArrival &operator=(const WorkArrival &) = delete;

private:
    Service &m_service;
    std::string m_taskId;
};

} // namespace emulator
