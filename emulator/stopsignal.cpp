#include "stopsignal.h"

namespace emulator {

void StopSignal::raise() {
    {
        const std::lock_guard lock(m_mutex);
        m_raised = true;
    }
    m_changed.notify_all();
}

bool StopSignal::raised() const {
    const std::lock_guard lock(m_mutex);
    return m_raised;
}

bool StopSignal::waitFor(std::chrono::milliseconds time) const {
    std::unique_lock lock(m_mutex);
    return m_changed.wait_for(lock, time, [this] { return m_raised; });
}

} // namespace emulator
