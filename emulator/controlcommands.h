#pragma once

#include <span>
#include <string>
#include <vector>

namespace emulator {

class Faults;
class Service;

/// What the commands act on; used by the thread that reads them.
struct ControlContext {
    Service &service;
    Faults &faults;
    bool stopRequested = false;
};

/// A command of the control. Its row is all that a new one needs: the help is made of the rows.
struct ControlCommand {
    using Arguments = std::span<const std::string>;

    const char *name;      ///< one word or two
    const char *arguments; ///< separated by blanks; in brackets those that may be left out
    const char *help;
    /// Returns the response. Throws std::exception for arguments that it does not take.
    std::string (*run)(ControlContext &, Arguments);
};

/// Runs a line of words. Returns the response, which begins with "ok"; throws std::exception.
std::string runCommand(ControlContext &context, const std::vector<std::string> &words);

/// A line for each command.
std::string controlHelp();

} // namespace emulator
