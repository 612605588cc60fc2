#include "tasks/workarrival.h"

#include "http/answer.h"
#include "http/dispatcher.h"
#include "service.h"
#include "simulation/clock.h"

namespace emulator {

namespace {

/// Empty where the parameters name none; what is wrong with them is told when all of the form is there.
std::string taskIdOf(const IncomingRequest &incoming) {
    try {
        const Json parameters = parseJson(incoming.body);
        return parameters.is_object() ? optionalText(parameters, "tid") : std::string();
    } catch (const Refusal &) {
        return {};
    }
}

} // namespace

WorkArrival::WorkArrival(Service &service, const IncomingRequest &incoming)
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
