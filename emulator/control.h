#pragma once

#include "controlcommands.h"

#include <string>
#include <thread>

namespace emulator {

class StopSignal;

/// Takes commands from standard input while the service runs. The end of the input ends nothing else.
class Control {
public:
    Control(Service &service, Faults &faults, const StopSignal &stop);
    /// Waits for the reader, which ends with the stop signal.
    ~Control();

private:
    void readInput();
    std::string respond(const std::string &line);

    ControlContext m_context; ///< of the reading thread
    const StopSignal &m_stop;
    std::thread m_reader;
};

} // namespace emulator
