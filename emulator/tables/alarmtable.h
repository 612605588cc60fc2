#pragma once

#include "http/jsonaccess.h"
#include "tables/recordlist.h"

#include <cstdint>
#include <string>
#include <vector>

namespace emulator {

class LogTable;
struct Device;

/// The kinds of alarms; the numbers are sent.
enum class AlarmKind {
    ServerStarted = 1,
    LostConnection = 2,
    ConnectionRestored = 3,
    CardError = 4,
    ServerStopped = 5,
    AuthorizationLost = 6,
};

/// The alarms that have not been removed.
class AlarmTable {
public:
    AlarmTable(Store &store, LogTable &log);

    /// Raises an alarm, of the server where there is no device, and writes it to the log.
    void raise(AlarmKind kind, const Device *device, std::int64_t nowMs);
    /// Takes an alarm of the past in, without the log.
    void add(AlarmKind kind, const Device *device, std::int64_t at);

    /// Throws Refusal(UnknownId), and removes none, when one is unknown.
    void remove(const std::vector<std::string> &ids);
    /// Newest first.
    std::string pageText(Page page) const;

private:
    void add(AlarmKind kind, const Device *device, const std::string &name, std::int64_t at);

    RecordList m_alarms;
    Store &m_store;
    LogTable &m_log;
};

/// What people call a device: its host name, or else its address.
std::string displayName(const Device &device);

/// The text of an alarm about an account or a device.
std::string descriptionOf(AlarmKind kind, const std::string &name);

} // namespace emulator
