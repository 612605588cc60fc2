#pragma once

#include <QString>

/// State of the local device manager service, with the codes that the start-up screen decides by.
enum class LocalServiceState {
    Unknown = 0,
    NotInstalled = 1,
    Running = 2,
    Stopped = 3,
    Starting = 4,
    Stopping = 5
};

namespace ServiceControl {

/// Asks the operating system once. Blocks: up to 30 s each for the start and the end of a child process.
LocalServiceState queryLocalService();

/// Judges the output of a service query: the last line of the form "STATE : <number>" decides.
LocalServiceState judgeQueryOutput(const QString &output);

} // namespace ServiceControl
