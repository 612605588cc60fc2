#pragma once

#include <chrono>
#include <condition_variable>
#include <mutex>

namespace emulator {

/// Lets every wait of the program end at once when the program is to stop.
class StopSignal {
public:
    void raise();
    bool raised() const;

    /// Waits for the time or the stop; true when it was the stop.
    bool waitFor(std::chrono::milliseconds time) const;

private:
    mutable std::mutex m_mutex;
    mutable std::condition_variable m_changed;
    bool m_raised = false;
};

} // namespace emulator
