#pragma once

#include <string>
#include <thread>
#include <vector>

namespace emulator {

class Faults;
class Service;
class StopSignal;

/// Takes commands from standard input while the service runs. The end of the input ends nothing else.
class Control {
public:
    Control(Service &service, Faults &faults, const StopSignal &stop);
    /// Waits for the reader, which ends with the stop signal.
    ~Control();

private:
    using Words = std::vector<std::string>;

    void readInput();
    std::string answer(const std::string &line);
    std::string run(const Words &words);
    std::string runOnDevices(const Words &words);
    std::string runOnTasks(const Words &words);
    std::string runOnAccounts(const Words &words);

    std::string fault(const std::string &text);
    std::string drop(const std::string &what);
    std::string restore(const std::string &what);
    std::string admit(const std::string &what);
    std::string remove(const std::string &id);
    std::string add(const std::string &count);
    std::string tick(const std::string &count);
    std::string status(const Words &words);
    std::string counts();
    std::string task(const Words &words);
    std::string taskRule(const std::string &rule, const std::string &value);
    std::string alarm(const Words &words);
    std::string orb(const Words &words);

    Service &m_service;
    Faults &m_faults;
    const StopSignal &m_stop;
    bool m_stopWasAsked = false; ///< of the reading thread
    std::thread m_reader;
};

} // namespace emulator
