#include "control.h"

#include "platform.h"
#include "stopsignal.h"

#include <iostream>
#include <stdexcept>
#include <vector>

namespace emulator {

namespace {

/// Splits at blanks; double quotes hold a word together.
std::vector<std::string> wordsOf(const std::string &line) {
    std::vector<std::string> words;
    bool quoted = false;
    bool inWord = false;
    for (const char c : line) {
        const bool blank = (c == ' ' || c == '\t' || c == '\r') && !quoted;
        if (!blank && !inWord)
            words.emplace_back();
        inWord = !blank;
        if (c == '"')
            quoted = !quoted;
        else if (!blank)
            words.back() += c;
    }
    return words;
}

} // namespace

Control::Control(Service &service, Faults &faults, const StopSignal &stop)
    : m_context{service, faults}, m_stop(stop), m_reader([this] { readInput(); }) {}

Control::~Control() {
    m_reader.join();
}

void Control::readInput() {
    std::string pending;
    // After "stop" no further line is waited for: not every system can say whether there is one.
    while (!m_stop.raised() && !m_context.stopRequested) {
        // Waking up now and then keeps the reader from outliving the rest of the program.
        const auto chunk = platform::readInput(std::chrono::milliseconds(200));
        if (!chunk)
            return;
        pending += *chunk;
        for (auto end = pending.find('\n'); end != std::string::npos; end = pending.find('\n')) {
            const std::string line = pending.substr(0, end);
            pending.erase(0, end + 1);
            std::cerr << respond(line) + "\n";
        }
    }
}

std::string Control::respond(const std::string &line) {
    try {
        return runCommand(m_context, wordsOf(line));
    } catch (const std::exception &error) {
        return std::string("error ") + error.what();
    }
}

} // namespace emulator
